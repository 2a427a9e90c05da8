#include "tests/tools/ToolRun.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>

namespace mayascene_test {
namespace {

std::vector<char*> pointers(std::vector<std::string>& words) {
  std::vector<char*> list;
  for (std::string& word : words) list.push_back(word.data());
  list.push_back(nullptr);
  return list;
}

ToolResult resultOf(int status) {
  ToolResult result;
  result.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  result.signal = WIFSIGNALED(status) ? WTERMSIG(status) : 0;
  return result;
}

}  // namespace

int ToolTest::spawn(const std::vector<std::string>& arguments, const std::string& out,
                    const std::string& err) const {
  std::vector<std::string> words = {MAYASCENE_TOOL};
  words.insert(words.end(), arguments.begin(), arguments.end());
  std::map<std::string, std::string> found = environment;
  found.insert({{"PATH", "/usr/bin:/bin"},
                {"HOME", captured_.path().string()},
                {"XDG_CONFIG_HOME", (captured_.path() / "config").string()},
                {"TERM", "xterm"}});
  std::vector<std::string> variables;
  for (const auto& [name, value] : found) variables.push_back(name + '=' + value);

  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_addchdir_np(
      &actions, workingFolder.empty() ? folder_.path().c_str() : workingFolder.c_str());
  posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
  posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, out.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, err.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  for (const int closed : closedDescriptors) posix_spawn_file_actions_addclose(&actions, closed);
  // A shell ignores interruptions on behalf of what it runs in the background, and what that runs would too.
  posix_spawnattr_t attributes;
  posix_spawnattr_init(&attributes);
  sigset_t defaults;
  sigemptyset(&defaults);
  for (const int signal : {SIGINT, SIGHUP, SIGTERM, SIGPIPE}) sigaddset(&defaults, signal);
  posix_spawnattr_setsigdefault(&attributes, &defaults);
  posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSIGDEF);
  pid_t process = -1;
  const int failure = ::posix_spawn(&process, MAYASCENE_TOOL, &actions, &attributes, pointers(words).data(),
                                    pointers(variables).data());
  posix_spawnattr_destroy(&attributes);
  posix_spawn_file_actions_destroy(&actions);
  if (failure != 0) throw std::runtime_error("the tool cannot be started");
  return process;
}

int ToolTest::start(const std::vector<std::string>& arguments) const {
  return spawn(arguments, captured_.path() / "out", captured_.path() / "err");
}

ToolResult ToolTest::end(int process) const {
  int status = 0;
  if (::waitpid(process, &status, 0) != process) throw std::runtime_error("the tool cannot be waited for");
  ToolResult result = resultOf(status);
  result.out = captured_.read("out");
  result.err = captured_.read("err");
  return result;
}

ToolResult ToolTest::run(const std::vector<std::string>& arguments) const { return end(start(arguments)); }

ToolResult ToolTest::runOnTerminal(const std::vector<std::string>& arguments) const {
  const int terminal = ::posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC);
  if (terminal < 0 || ::grantpt(terminal) != 0 || ::unlockpt(terminal) != 0) {
    throw std::runtime_error("no terminal");
  }
  const std::string side = ::ptsname(terminal);
  const int held = ::open(side.c_str(), O_RDWR | O_NOCTTY | O_CLOEXEC);  // so that the end shows as an end
  const int process = spawn(arguments, side, side);
  ::close(held);
  std::string text;
  std::array<char, 4096> part{};
  for (ssize_t count = 1; count > 0;) {
    count = ::read(terminal, part.data(), part.size());
    if (count > 0) text.append(part.data(), static_cast<std::size_t>(count));
  }
  ::close(terminal);
  int status = 0;
  if (::waitpid(process, &status, 0) != process) throw std::runtime_error("the tool cannot be waited for");
  ToolResult result = resultOf(status);
  text.erase(std::remove(text.begin(), text.end(), '\r'), text.end());
  result.out = text;
  return result;
}

void ToolTest::write(std::string_view name, std::string_view text) const { folder_.write(name, text); }

std::string ToolTest::read(std::string_view name) const { return folder_.read(name); }

std::vector<std::string> ToolTest::files() const {
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(folder_.path()))
    names.push_back(entry.path().filename());
  std::sort(names.begin(), names.end());
  return names;
}

std::string sceneText(std::string_view commands) {
  return "//Maya ASCII 2023 scene\n"
         "currentUnit -l centimeter -a degree -t film;\n"
         "select -ne :defaultResolution;\n"
         "\tsetAttr \".w\" 640;\n\tsetAttr \".h\" 360;\n\tsetAttr \".pa\" 1;\n" +
         std::string(commands) + "// End of scene\n";
}

std::string_view stillCamera() {
  return "createNode transform -n \"shotcam\";\n"
         "\tsetAttr \".t\" -type \"double3\" 1.5 2 3;\n"
         "createNode camera -n \"shotcamShape\" -p \"shotcam\";\n"
         "\tsetAttr \".cap\" -type \"double2\" 1 0.5;\n"
         "\tsetAttr \".fl\" 25.4;\n";
}

std::string_view craneCamera() {
  return "createNode transform -n \"boom\";\n"
         "createNode transform -n \"shotcam\" -p \"boom\";\n"
         "\tsetAttr \".t\" -type \"double3\" 0 0 10;\n"
         "createNode camera -n \"shotcamShape\" -p \"shotcam\";\n"
         "\tsetAttr \".cap\" -type \"double2\" 1 0.5;\n"
         "\tsetAttr \".fl\" 25.4;\n"
         "createNode animCurveTA -n \"boom_rotateX\";\n"
         "\tsetAttr -s 3 \".ktv[0:2]\" 1 0 2 7.5 3 15;\n"
         "connectAttr \"boom_rotateX.o\" \"boom.rx\";\n";
}

}  // namespace mayascene_test
