// A program that does one of the things that a child of a pool must survive, or make others survive.
//
//   say TEXT          writes TEXT on standard output
//   fill N CHAR       writes N times CHAR on standard output
//   end N             says "N" on standard error and ends with status N
//   signal N          ends by the signal N
//   hang              waits for ever, and ignores every signal that can be ignored
//   close             closes its streams and waits for ever
//   flood out|err     writes on the stream without end
//   eat               takes a gigabyte of memory; ends with status 5 when there is none left
//   make FILE         makes the file
//   await FILE        waits until the file is there
//   leave FILE        leaves a child behind that holds the streams until the file is gone
//   read              says how many bytes standard input has
//   process FILE      writes its process id into the file
//
// Several of these are carried out in their order.
#include <fcntl.h>
#include <signal.h>
#include <sys/resource.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iostream>
#include <memory>
#include <string>
#include <thread>
#include <vector>

namespace {

[[noreturn]] void waitForEver() {
  for (;;) ::pause();
}

void awaitFile(const std::string& name) {
  while (::access(name.c_str(), F_OK) != 0) std::this_thread::sleep_for(std::chrono::milliseconds(1));
}

[[noreturn]] void flood(int descriptor) {
  const std::string part(1 << 14, 'x');
  for (;;) {
    if (::write(descriptor, part.data(), part.size()) < 0) ::_exit(EXIT_FAILURE);
  }
}

void eatMemory() {
  constexpr std::size_t kPiece = 1 << 22;
  constexpr std::size_t kPieces = 256;
  std::vector<std::unique_ptr<char[]>> pieces;
  try {
    while (pieces.size() < kPieces) {
      pieces.push_back(std::make_unique<char[]>(kPiece));
      std::memset(pieces.back().get(), 1, kPiece);
    }
  } catch (const std::bad_alloc&) {
    std::cerr << "no more memory\n";
    std::exit(5);
  }
}

[[noreturn]] void endBySignal(int number) {
  const rlimit none{0, 0};
  ::setrlimit(RLIMIT_CORE, &none);
  ::signal(number, SIG_DFL);
  ::raise(number);
  waitForEver();
}

void leaveChild(const std::string& file) {
  if (::fork() != 0) return;
  while (::access(file.c_str(), F_OK) == 0) std::this_thread::sleep_for(std::chrono::milliseconds(1));
  ::_exit(EXIT_SUCCESS);
}

void sayInput() {
  char byte = 0;
  std::size_t count = 0;
  while (::read(STDIN_FILENO, &byte, 1) == 1) ++count;
  std::cout << count << std::flush;
}

[[noreturn]] void hang() {
  for (const int number : {SIGINT, SIGTERM, SIGHUP}) ::signal(number, SIG_IGN);
  waitForEver();
}

// What needs no word after it.
bool doPlain(const std::string& what) {
  if (what == "hang") hang();
  if (what == "eat") eatMemory();
  if (what == "close") {
    for (const int descriptor : {STDOUT_FILENO, STDERR_FILENO}) ::close(descriptor);
    waitForEver();
  }
  if (what == "read") sayInput();
  return what == "read" || what == "eat";
}

void doWith(const std::string& what, const std::string& word) {
  if (what == "say") std::cout << word << std::flush;
  if (what == "end") {
    std::cerr << word << std::flush;
    std::exit(std::stoi(word));
  }
  if (what == "signal") endBySignal(std::stoi(word));
  if (what == "flood") flood(word == "out" ? STDOUT_FILENO : STDERR_FILENO);
  if (what == "make") std::ofstream(word).flush();
  if (what == "await") awaitFile(word);
  if (what == "leave") leaveChild(word);
  if (what == "process") std::ofstream(word) << ::getpid();
}

}  // namespace

int main(int argc, char** argv) {
  const std::vector<std::string> words(argv + 1, argv + argc);
  for (std::size_t i = 0; i < words.size(); ++i) {
    if (doPlain(words[i])) continue;
    if (words[i] == "fill") {
      std::cout << std::string(std::stoul(words.at(i + 1)), words.at(i + 2).at(0)) << std::flush;
      i += 2;
    } else {
      doWith(words[i], words.at(i + 1));
      ++i;
    }
  }
  return EXIT_SUCCESS;
}
