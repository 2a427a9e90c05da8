// command-pages FOLDER: writes the manual pages and the completions of the tool into the folder, with the
// layout of an installed "share" folder.
#include <exception>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <string>

#include "tools/mayascene/CommandTable.h"
#include "tools/mayascene/Completions.h"
#include "tools/mayascene/ManPage.h"

namespace {

void write(const std::filesystem::path& file, const std::string& text) {
  std::filesystem::create_directories(file.parent_path());
  std::ofstream out(file, std::ios::binary);
  out.exceptions(std::ios::badbit | std::ios::failbit);
  out << text << std::flush;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) return 2;
  try {
    const std::filesystem::path share = argv[1];
    const mayascene::CommandTable tool = mayascene::commandTable();
    for (const mayascene::CommandTable* table : mayascene::allTables(tool)) {
      write(share / "man/man1" / (mayascene::manPageName(*table) + ".1"), mayascene::manPage(*table, tool));
    }
    write(share / "bash-completion/completions/mayascene", mayascene::bashCompletion(tool));
    write(share / "zsh/site-functions/_mayascene", mayascene::zshCompletion(tool));
    write(share / "fish/vendor_completions.d/mayascene.fish", mayascene::fishCompletion(tool));
  } catch (const std::exception& failure) {
    std::cerr << "command-pages: " << failure.what() << '\n';
    return 5;
  }
  return 0;
}
