// Where the bakes of a run go.
#pragma once

#include <string>
#include <vector>

namespace mayascene {

// A file for each scene. One scene's is `output`, unless that is a folder; those of several lie in the folder
// `output`, under the scenes' own names, with _2, _3 … where two are the same without regard to case. Empty,
// with a sentence in *failure, where a bake would be written over one of the scenes, or where `output` is no
// folder and cannot be made one.
std::vector<std::string> placeBakes(const std::vector<std::string>& scenes, const std::string& output,
                                    std::string* failure);

}  // namespace mayascene
