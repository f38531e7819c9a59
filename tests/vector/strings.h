// Vectors as texts: one letter a string, '-' a null place.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "vector/ZORISVectorImp_String.h"

inline ZORString* New(char letter) { return new ZORString(ZORChar(letter), 1); }

// A vector that owns its strings, so that the leak checker sees the ones that got lost.
struct Strings : ZORISVectorImp_String {
  using ZORISVectorImp_String::ZORISVectorImp_String;

  explicit Strings(const std::string& letters) : ZORISVectorImp_String(20, 20u) {
    for (char c : letters) EXPECT_EQ(1, Add(New(c)));
  }
  Strings(const Strings&) = delete;
  ~Strings() override { Flush(1); }
};

// Adds by add what is deleted when it stays the caller's.
template <class... Position>
int Store(ZORISVectorImp_String& v, int (ZORISVectorImp_String::*add)(ZORString*, Position...), char letter,
          Position... pos) {
  ZORString* s = New(letter);
  const unsigned int count = v.Count();
  const int answer = (v.*add)(s, pos...);
  if (v.Count() == count) delete s;
  return answer;
}
inline int Add(ZORISVectorImp_String& v, char c) { return Store(v, &ZORISVectorImp_String::Add, c); }
inline int AddUnique(ZORISVectorImp_String& v, char c) { return Store(v, &ZORISVectorImp_String::AddUnique, c); }
inline int AddAt(ZORISVectorImp_String& v, char c, unsigned int pos) {
  return Store(v, &ZORISVectorImp_String::AddAt, c, pos);
}
inline int Detach(ZORISVectorImp_String& v, char letter) {
  const ZORString s(ZORChar(letter), 1);
  return v.Detach(&s, 1);
}

inline std::string Show(const ZORISVectorImp_String& v, unsigned int first, unsigned int last) {
  std::string letters;
  for (unsigned int i = first; i < last; ++i) letters += v[i] != nullptr ? v[i]->CastToCharPtr() : "-";
  return letters;
}
inline std::string Show(const ZORISVectorImp_String& v) { return Show(v, 0, v.Top()); }

inline void ExpectNullBehindTop(const ZORISVectorImp_String& v) {
  EXPECT_EQ(std::string(v.Limit() - v.Top(), '-'), Show(v, v.Top(), v.Limit()));
}
