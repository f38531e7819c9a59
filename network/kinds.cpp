#include "network/kinds.h"

#include <algorithm>

namespace zornet {

namespace {

constexpr Takes T = Takes::Text, I = Takes::Integer, B = Takes::Boolean, V = Takes::Anything;

// clang-format off
constexpr Kind kKinds[] = {
  // name          meaning                mirrored truth  arity takes         roles
  {"str_eq",       Meaning::Equal,         false, false,  2,    {T, T},       {"x", "y"}},
  {"str_ne",       Meaning::Unequal,       false, false,  2,    {T, T},       {"x", "y"}},
  {"str_lt",       Meaning::Below,         false, false,  2,    {T, T},       {"x", "y"}},
  {"str_le",       Meaning::NotAbove,      false, false,  2,    {T, T},       {"x", "y"}},
  {"str_gt",       Meaning::Below,         true,  false,  2,    {T, T},       {"x", "y"}},
  {"str_ge",       Meaning::NotAbove,      true,  false,  2,    {T, T},       {"x", "y"}},

  {"str_eq_reif",  Meaning::Equal,         false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_lt_reif",  Meaning::Below,         false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_le_reif",  Meaning::NotAbove,      false, true,   3,    {T, T, B},    {"x", "y", "b"}},

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

}  // namespace

std::span<const Kind> Kinds() { return kKinds; }

const Kind* FindKind(std::string_view name) {
  const auto* found = std::find_if(std::begin(kKinds), std::end(kKinds), [&](const Kind& k) { return k.name == name; });
  return found != std::end(kKinds) ? found : nullptr;
}

std::string_view Describe(Takes takes) {
  switch (takes) {
    case Takes::Text:
      return "a text";
    case Takes::Integer:
      return "an integer";
    case Takes::Boolean:
      return "a truth value";
    case Takes::Anything:
      return "anything";
  }
  return "";
}

}  // namespace zornet
