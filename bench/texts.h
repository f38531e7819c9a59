// The texts of the workloads, the same in every run.
#pragma once

#include <random>
#include <string>
#include <vector>

namespace zor::bench {

using Texts = std::vector<std::string>;

// Makes texts of 8 to 24 characters that begin with one of a few words, as the names of files or articles do.
class TextMaker {
 public:
  explicit TextMaker(unsigned int seed) : mRandom(seed) {}

  std::size_t Below(std::size_t bound) { return mRandom() % bound; }
  std::string Letters(std::size_t length);
  std::string Next();
  Texts Distinct(std::size_t count);  // ascending
  void Shuffle(Texts& texts);

 private:
  std::mt19937 mRandom;
};

}  // namespace zor::bench
