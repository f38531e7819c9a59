// Networks, each written for zornet and as SMT-LIB.
#pragma once

#include <cstddef>
#include <string>

namespace zor::bench {

struct Problem {
  std::string network, smt;
};

// Of about size constraints. All have a solution.
Problem Chain(std::size_t size);  // a text that loses four characters in front and gains four behind, again and again
Problem Sets(std::size_t size);   // the same with sets, of which half the texts fit
Problem Order(std::size_t size);  // sets of 16 texts, each at most the next
Problem SmallOrder(std::size_t size);  // sets of 4
Problem Mix(std::size_t size);         // a third of each, side by side

}  // namespace zor::bench
