#include "host/NumberText.h"

#include <algorithm>

#include "host/IntegerSet.h"

namespace {

bool IsLetter(int c) { return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z'); }
bool IsDigit(int c) { return c >= '0' && c <= '9'; }

char Take(ZORistrstream& in) {
  char c;
  in >> c;
  return c;
}

}  // namespace

std::string zorhost::ReadWord(ZORistrstream& in) {
  std::string word;
  in >> ws;
  while (IsLetter(in.Peek())) word.push_back(Take(in));
  return word;
}

std::optional<ZORLong> zorhost::ReadNumber(ZORistrstream& in) {
  const bool negative = in.Peek() == '-';
  if (negative) in.Ignore();
  if (!IsDigit(in.Peek())) return std::nullopt;
  std::int64_t value = 0;
  while (IsDigit(in.Peek())) value = std::min(value * 10 + (Take(in) - '0'), ZORIntegerSet::kAbove);
  if (negative) value = -value;
  if (value < ZORIntegerSet::kLeast || value > ZORIntegerSet::kGreatest) return std::nullopt;
  return static_cast<ZORLong>(value);
}

void zorhost::PrintNumber(ZORostrstream& out, ZORLong value) { out << std::to_string(value).c_str(); }
