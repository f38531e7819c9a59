// What is known of a text that is not listed: its length, how it begins and ends, the characters it may have, and two
// texts between which it lies. Beside all of that it may be the greatest text, which a concatenation of too many
// characters gives.
//
// A shape is only ever met with others, so it shrinks and narrowing ends. It is not exact: it may admit texts that no
// solution has. Up to 31 characters of each text in it are stored without an allocation.
#pragma once

#include <bitset>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "network/texts.h"

namespace zornet {

// By code, from the space on.
using Characters = std::bitset<'z' - ' ' + 1>;
Characters CharactersOf(std::string_view text);
inline std::size_t BitOf(char c) { return static_cast<std::size_t>(static_cast<unsigned char>(c) - ' '); }
inline char CharacterAt(std::size_t bit) { return static_cast<char>(' ' + bit); }

struct Shape {
  int shortest = 0, longest = kTextLimit;  // in characters
  ZORString beginning, end;
  ZORString least, greatest = GreatestText();
  Characters characters = Characters().set();
  bool orGreatest = false;

  Shape() = default;
  explicit Shape(const ZORString& text);
  explicit Shape(std::span<const ZORString> texts);  // the least shape that admits all of them

  // Of the texts of the parts one after another, however long, or the greatest text where one of them may be that.
  static Shape Concatenation(std::span<const Shape> parts);

  bool operator==(const Shape&) const = default;
  bool IsAnything() const { return *this == Shape(); }
  bool IsNothing() const { return shortest > longest && !orGreatest; }
  bool Admits(std::string_view text) const;
  bool IsWhole() const { return beginning.GetLengthInChar() == longest; }  // the one text is its beginning
  std::optional<ZORString> Only() const;                                   // the text, if it admits a single one

  void Meet(const Shape& other);     // admits what both admit
  void Include(const Shape& other);  // admits what either admits
  Shape Plain() const;               // with the greatest text among the others
  ZORString Lowest() const;          // no text is less
  ZORString Highest() const;         // no text is greater
  ZORString Ceiling() const;

 private:
  void Settle();
  bool Fits(int length) const;
  void Join(int length);
  void Become(const ZORString& text);
  void BecomeNothing();
};

// For people: "https://…", 8 to 255 characters
std::string Describe(const Shape& shape);

}  // namespace zornet
