// Graphs as files; - is standard output. Both throw std::runtime_error when the file cannot be written.
#pragma once

#include <string>

namespace zornet {

void WriteGraph(const std::string& file, const std::string& graph);
void WritePicture(const std::string& file, const std::string& graph);  // runs dot, which draws it

}  // namespace zornet
