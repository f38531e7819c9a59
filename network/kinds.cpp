#include "network/ZORModel.h"

#include <algorithm>
#include <array>

namespace zornet {

namespace {

constexpr Takes T = Takes::Text, I = Takes::Integer, B = Takes::Boolean, V = Takes::Anything, Ts = Takes::Texts,
                Is = Takes::Integers, Bs = Takes::Booleans, E = Takes::Expression, R = Takes::Rows;

// clang-format off
constexpr Kind kKinds[] = {
  // name          meaning                mirrored reified arity takes         roles
  {"str_eq",       Meaning::Equal,         false, false,  2,    {T, T},       {"x", "y"}},
  {"str_ne",       Meaning::Unequal,       false, false,  2,    {T, T},       {"x", "y"}},
  {"str_lt",       Meaning::Less,          false, false,  2,    {T, T},       {"x", "y"}},
  {"str_le",       Meaning::LessOrEqual,   false, false,  2,    {T, T},       {"x", "y"}},
  {"str_gt",       Meaning::Less,          true,  false,  2,    {T, T},       {"x", "y"}},
  {"str_ge",       Meaning::LessOrEqual,   true,  false,  2,    {T, T},       {"x", "y"}},

  {"str_eq_reif",  Meaning::Equal,         false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_lt_reif",  Meaning::Less,          false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_ne_reif",  Meaning::Unequal,       false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_le_reif",  Meaning::LessOrEqual,   false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_gt_reif",  Meaning::Less,          true,  true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_ge_reif",  Meaning::LessOrEqual,   true,  true,   3,    {T, T, B},    {"x", "y", "b"}},

  {"str_prefix",   Meaning::Prefix,        false, false,  2,    {T, T},       {"x", "y"}},
  {"str_suffix",   Meaning::Suffix,        false, false,  2,    {T, T},       {"x", "y"}},
  {"str_contains", Meaning::Contains,      false, false,  2,    {T, T},       {"x", "y"}},
  {"str_matches",  Meaning::Matches,       false, false,  2,    {T, E},       {"x", "expression"}},
  {"str_find",     Meaning::Position,      false, false,  3,    {T, T, I},    {"x", "y", "n"}},
  {"str_replace",  Meaning::ReplaceFirst,  false, false,  4,    {T, T, T, T}, {"x", "from", "to", "z"}},
  {"str_replace_all", Meaning::ReplaceAll, false, false,  4,    {T, T, T, T}, {"x", "from", "to", "z"}},
  {"str_prefix_reif",   Meaning::Prefix,   false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_suffix_reif",   Meaning::Suffix,   false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_contains_reif", Meaning::Contains, false, true,   3,    {T, T, B},    {"x", "y", "b"}},
  {"str_matches_reif",  Meaning::Matches,  false, true,   3,    {T, E, B},    {"x", "expression", "b"}},
  {"str_find_reif",     Meaning::Position, false, true,   4,    {T, T, I, B}, {"x", "y", "n", "b"}},
  {"str_replace_reif",  Meaning::ReplaceFirst, false, true, 5,  {T, T, T, T, B}, {"x", "from", "to", "z", "b"}},
  {"str_replace_all_reif", Meaning::ReplaceAll, false, true, 5, {T, T, T, T, B}, {"x", "from", "to", "z", "b"}},
  {"str_all_different", Meaning::AllDifferent, false, false, 1, {Ts},         {"xs"}},
  {"str_table",    Meaning::Row,           false, false,  2,    {Ts, R},      {"xs", "rows"}},

  {"str_concat",   Meaning::Concatenation, false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_concat",   Meaning::Concatenation, false, false,  2,    {Ts, T},      {"xs", "z"}},
  {"str_substr",   Meaning::Slice,         false, false,  4,    {T, I, I, T}, {"x", "from", "to", "z"}},
  {"str_length",   Meaning::Length,        false, false,  2,    {T, I},       {"x", "n"}},
  {"str_lower",    Meaning::Lower,         false, false,  2,    {T, T},       {"x", "z"}},
  {"str_upper",    Meaning::Upper,         false, false,  2,    {T, T},       {"x", "z"}},
  {"str_min",      Meaning::Minimum,       false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_max",      Meaning::Maximum,       false, false,  3,    {T, T, T},    {"x", "y", "z"}},
  {"str_min",      Meaning::Minimum,       false, false,  2,    {Ts, T},      {"xs", "z"}},
  {"str_max",      Meaning::Maximum,       false, false,  2,    {Ts, T},      {"xs", "z"}},
  {"str_next",     Meaning::Successor,     false, false,  2,    {T, T},       {"x", "z"}},
  {"str_text",     Meaning::TextForm,      false, false,  2,    {V, T},       {"v", "x"}},

  {"int_eq",       Meaning::Equal,         false, false,  2,    {I, I},       {"x", "y"}},
  {"int_ne",       Meaning::Unequal,       false, false,  2,    {I, I},       {"x", "y"}},
  {"int_lt",       Meaning::Less,           false, false,  2,    {I, I},       {"x", "y"}},
  {"int_le",       Meaning::LessOrEqual,   false, false,  2,    {I, I},       {"x", "y"}},
  {"int_eq_reif",  Meaning::Equal,         false, true,   3,    {I, I, B},    {"x", "y", "b"}},
  {"int_ne_reif",  Meaning::Unequal,       false, true,   3,    {I, I, B},    {"x", "y", "b"}},
  {"int_lt_reif",  Meaning::Less,           false, true,   3,    {I, I, B},    {"x", "y", "b"}},
  {"int_le_reif",  Meaning::LessOrEqual,   false, true,   3,    {I, I, B},    {"x", "y", "b"}},
  {"int_plus",     Meaning::Sum,           false, false,  3,    {I, I, I},    {"x", "y", "z"}},
  {"int_times",    Meaning::Product,       false, false,  3,    {I, I, I},    {"x", "y", "z"}},
  {"int_min",      Meaning::Minimum,       false, false,  3,    {I, I, I},    {"x", "y", "z"}},
  {"int_max",      Meaning::Maximum,       false, false,  3,    {I, I, I},    {"x", "y", "z"}},
  {"int_min",      Meaning::Minimum,       false, false,  2,    {Is, I},      {"xs", "z"}},
  {"int_max",      Meaning::Maximum,       false, false,  2,    {Is, I},      {"xs", "z"}},
  {"int_sum",      Meaning::Sum,           false, false,  2,    {Is, I},      {"xs", "s"}},

  {"bool_eq",      Meaning::Equal,         false, false,  2,    {B, B},       {"a", "b"}},
  {"bool_not",     Meaning::Unequal,       false, false,  2,    {B, B},       {"a", "b"}},
  {"bool_lt",      Meaning::Less,           false, false,  2,    {B, B},       {"a", "b"}},
  {"bool_le",      Meaning::LessOrEqual,   false, false,  2,    {B, B},       {"a", "b"}},
  {"bool_imply",   Meaning::LessOrEqual,   false, false,  2,    {B, B},       {"a", "b"}},
  {"bool_eq_reif", Meaning::Equal,         false, true,   3,    {B, B, B},    {"a", "b", "r"}},
  {"bool_xor",     Meaning::Unequal,       false, true,   3,    {B, B, B},    {"a", "b", "r"}},
  {"bool_lt_reif", Meaning::Less,           false, true,   3,    {B, B, B},    {"a", "b", "r"}},
  {"bool_le_reif", Meaning::LessOrEqual,   false, true,   3,    {B, B, B},    {"a", "b", "r"}},
  {"bool_and",     Meaning::Minimum,       false, false,  3,    {B, B, B},    {"a", "b", "r"}},
  {"bool_or",      Meaning::Maximum,       false, false,  3,    {B, B, B},    {"a", "b", "r"}},
  {"array_bool_and", Meaning::Minimum,     false, false,  2,    {Bs, B},      {"as", "r"}},
  {"array_bool_or",  Meaning::Maximum,     false, false,  2,    {Bs, B},      {"as", "r"}},
  {"bool2int",     Meaning::Equal,         false, false,  2,    {B, I},       {"b", "n"}},
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

constexpr std::string_view NameAt(std::size_t at) { return kKinds[at].name; }

constexpr auto kByName = [] {
  std::array<std::size_t, std::size(kKinds)> order{};
  for (std::size_t i = 0; i < order.size(); ++i) order[i] = i;
  std::sort(order.begin(), order.end(),
            [](std::size_t a, std::size_t b) { return NameAt(a) != NameAt(b) ? NameAt(a) < NameAt(b) : a < b; });
  return order;
}();

}  // namespace

std::span<const Kind> Kinds() { return kKinds; }

const Kind* FindKind(std::string_view name, bool list) {
  const Kind* found = nullptr;
  const auto* at = std::lower_bound(kByName.begin(), kByName.end(), name,
                                    [](std::size_t kind, std::string_view sought) { return NameAt(kind) < sought; });
  for (; at != kByName.end() && NameAt(*at) == name; ++at) {
    if (found == nullptr || kKinds[*at].HasList() == list) found = &kKinds[*at];
  }
  return found;
}

bool Kind::HasList() const { return std::any_of(takes.begin(), takes.begin() + arity, IsList); }

Takes MemberOf(Takes list) {
  switch (list) {
    case Takes::Texts:
      return Takes::Text;
    case Takes::Integers:
      return Takes::Integer;
    case Takes::Booleans:
      return Takes::Boolean;
    default:
      return list;
  }
}

std::size_t Constraint::Place(std::size_t position) const {
  const auto first = kind->takes.begin(), last = first + kind->arity;
  const auto variables = static_cast<std::size_t>(std::count_if(first, last, IsVariable));
  const auto takenBy = [&](Takes takes) -> std::size_t {
    return IsList(takes) ? arguments.size() + 1 - variables : IsVariable(takes) ? 1 : 0;
  };
  std::size_t place = 0;
  for (; position >= takenBy(kind->takes[place]); ++place) position -= takenBy(kind->takes[place]);
  return place;
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
    default:
      return false;  // no variable is a list
  }
}

const SortNames& NamesOf(Sort sort) { return kSortNames[static_cast<std::size_t>(sort)]; }

}  // namespace zornet
