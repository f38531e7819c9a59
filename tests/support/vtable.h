// Where a virtual operation stands in its class's table, under the Itanium C++ ABI.
#pragma once

#include <cstddef>
#include <cstring>

// Slots count from the first of the two destructor entries of a class whose table begins with its destructor; -1 when
// member is not virtual. Overloads are named by a cast to the member's type.
template <class Member>
std::ptrdiff_t Slot(Member member) {
  std::ptrdiff_t words[2];  // 1 + the offset in the table, or the address of a function; the adjustment of this
  static_assert(sizeof member == sizeof words);
  std::memcpy(words, &member, sizeof words);
  return words[0] % 2 == 0 ? -1 : words[0] / static_cast<std::ptrdiff_t>(sizeof(void*));
}
