#include "diag/Page.h"

#include <fmt/format.h>

#include <array>
#include <cstddef>
#include <string_view>

#include "diag/Codes.h"

namespace diag {
namespace {

struct Topic {
  unsigned first;
  std::string_view title;
};

constexpr std::array kTopics = {
    Topic{100, "Reading the file"},
    Topic{200, "Nodes, names, units"},
    Topic{300, "Curves"},
    Topic{400, "What drives a channel"},
    Topic{500, "Cameras and locators"},
    Topic{600, "What a bake writes"},
    Topic{700, "What stops an import"},
    Topic{800, "What does not come over"},
    Topic{900, "Where the picture differs"},
    Topic{1000, "What cuts a check short"},
    Topic{1100, "What an export cannot write"},
};

constexpr std::string_view kIntroduction =
    R"(# Diagnostics

All diagnostics about a scene, code by code. This page is made from the table of codes in `diag/`.

A diagnostic has the form that compilers use. File, line and column say where; lines and columns count from 1, and a
column counts bytes.

```
shot.ma:12:9: warning: this string has no closing quote [MA0101]
help: Close the string, or export the scene again.
```

- An *error* means that something asked for could not be done.
- A *warning* means that the result may differ from what the scene shows.
- A *note* is for information.

At most 20 diagnostics of one code are shown in full. The rest are counted.

In the sentences below, {0}, {1} and so on stand for what the file says. An example is a part of a scene, a part of a
composition as JSON, or what is typed in a shell: it then begins with `$`.
)";

constexpr std::size_t kLineLength = 120;

// The text in lines of at most kLineLength bytes, broken between words.
std::string Wrapped(std::string_view text) {
  std::string wrapped;
  std::size_t length = 0;
  while (!text.empty()) {
    const std::size_t end = text.find(' ');
    const std::string_view word = text.substr(0, end);
    if (length != 0 && length + 1 + word.size() > kLineLength) {
      wrapped += '\n';
      length = 0;
    } else if (length != 0) {
      wrapped += ' ';
      ++length;
    }
    wrapped += word;
    length += word.size();
    text = end == std::string_view::npos ? std::string_view() : text.substr(end + 1);
  }
  return wrapped + '\n';
}

std::string Section(const Entry& entry) {
  const std::string example = entry.example.empty() ? "" : fmt::format("\n```\n{}\n```\n", entry.example);
  return fmt::format("\n### {}\n\n{}\n{}{}\n{}", NameOf(entry.code),
                     Wrapped(fmt::format("{}: {}", NameOf(entry.severity), entry.sentence)),
                     Wrapped(entry.meaning), example, Wrapped(fmt::format("What to do: {}", entry.help)));
}

}  // namespace

std::string Page() {
  std::string page(kIntroduction);
  const Topic* topic = nullptr;
  for (const Entry& entry : Table()) {
    for (const Topic& candidate : kTopics) {
      const bool holds = static_cast<unsigned>(entry.code) / 100 * 100 == candidate.first;
      if (!holds || topic == &candidate) continue;
      topic = &candidate;
      page += fmt::format("\n## {}\n", topic->title);
    }
    page += Section(entry);
  }
  return page;
}

}  // namespace diag
