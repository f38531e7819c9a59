#include "network/ZORModel.h"

#include <algorithm>

namespace zornet {

namespace {

constexpr Takes T = Takes::Text, I = Takes::Integer, B = Takes::Boolean, V = Takes::Anything;

// clang-format off
constexpr Kind kKinds[] = {
  // name          meaning                mirrored reified arity takes         roles
  {"str_eq",       Meaning::Equal,         false, false,  2,    {T, T},       {"x", "y"}},
  {"str_ne",       Meaning::Unequal,       false, false,  2,    {T, T},       {"x", "y"}},
  {"str_lt",       Meaning::Less,         false, false,  2,    {T, T},       {"x", "y"}},
  {"str_le",       Meaning::LessOrEqual,      false, false,  2,    {T, T},       {"x", "y"}},
  {"str_gt",       Meaning::Less,         true,  false,  2,    {T, T},       {"x", "y"}},
  {"str_ge",       Meaning::LessOrEqual,      true,  false,  2,    {T, T},       {"x", "y"}},

  {"str_eq_reif",  Meaning::Equal,         false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_lt_reif",  Meaning::Less,         false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_le_reif",  Meaning::LessOrEqual,      false, true,   3,    {T, T, B},    {"x", "y", "b"}},

  {"str_concat",   Meaning::Concatenation, false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_substr",   Meaning::Slice,         false, false,  4,    {T, I, I, T}, {"x", "from", "to", "z"}},
  {"str_length",   Meaning::Length,        false, false,  2,    {T, I},       {"x", "n"}},
  {"str_lower",    Meaning::Lower,         false, false,  2,    {T, T},       {"x", "z"}},
  {"str_upper",    Meaning::Upper,         false, false,  2,    {T, T},       {"x", "z"}},
  {"str_min",      Meaning::Minimum,       false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_max",      Meaning::Maximum,       false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_next",     Meaning::Successor,     false, false,  2,    {T, T},       {"x", "z"}},
  {"str_text",     Meaning::TextForm,      false, false,  2,    {V, T},       {"v", "x"}},
};
// clang-format on

// In the order of Sort.
constexpr SortNames kSortNames[kSorts] = {
    {"string", "a text", "single string"},
    {"set string", "a set of texts", "enum string"},
    {"int", "an integer", "single integer"},
    {"interval", "an interval", "interval integer"},
    {"set int", "a set of integers", "enum integer"},
    {"bool", "a truth value", "single boolean"},
};

}  // namespace

std::span<const Kind> Kinds() { return kKinds; }

const Kind* FindKind(std::string_view name) {
  const auto* found = std::find_if(std::begin(kKinds), std::end(kKinds), [&](const Kind& k) { return k.name == name; });
  return found != std::end(kKinds) ? found : nullptr;
}

bool Fits(Sort sort, Takes takes) {
  switch (takes) {
    case Takes::Text:
      return IsText(sort);
    case Takes::Integer:
      return IsInteger(sort);
    case Takes::Boolean:
      return sort == Sort::Boolean;
    case Takes::Anything:
      return true;
  }
  return false;
}

const SortNames& NamesOf(Sort sort) { return kSortNames[static_cast<std::size_t>(sort)]; }

}  // namespace zornet
