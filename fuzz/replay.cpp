// Runs a fuzz target over files and folders of inputs, in builds without a fuzzer.
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include "fuzz/support.h"

namespace {

void Replay(const std::filesystem::path& file) {
  std::ifstream in(file, std::ios::binary);
  const std::vector<char> bytes{std::istreambuf_iterator<char>(in), {}};
  if (in.bad() || !in.is_open()) zor::fuzz::Fail("cannot read " + file.string());
  std::printf("%s\n", file.c_str());
  std::fflush(stdout);  // an input that fails is the last one named
  LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
}

}  // namespace

int main(int argc, char** argv) {
  int count = 0;
  for (int i = 1; i < argc; ++i) {
    if (std::filesystem::is_directory(argv[i])) {
      for (const auto& entry : std::filesystem::directory_iterator(argv[i])) Replay(entry.path()), ++count;
    } else {
      Replay(argv[i]), ++count;
    }
  }
  if (count == 0) zor::fuzz::Fail("no inputs");
}
