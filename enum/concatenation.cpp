// Concatenation of sets of texts.
#include <string_view>
#include <utility>

#include "enum/entries.h"
#include "module/texts.h"

namespace {

using zor::TextSet;

// Marks the texts that are a head followed by a tail. Texts with the same head are adjacent and ordered by what follows
// it, so one pass compares them with the tails, and often the next text is the next pair. Of equal texts only the first
// is marked.
TextSet::Marks MarkPairs(const TextSet& texts, const TextSet& heads, const TextSet& tails) {
  const unsigned int count = texts.Count(), tailCount = tails.Count();
  TextSet::Marks marks;
  unsigned int i = 0;
  for (const ZORString* const head : heads.All()) {
    i = texts.CountLess(*head, i);
    for (unsigned int t = 0; i < count; ++i) {
      const ZORString& text = texts[i];
      if (!text.IsConcatenation(*head, tails[t])) {
        if (!text.View().starts_with(head->View())) break;
        const std::string_view rest = text.View().substr(head->View().size());
        while (t < tailCount && tails[t].View() < rest) ++t;
        if (t == tailCount) break;
        if (tails[t].View() != rest) continue;
      }
      if (i == 0 || texts[i - 1] != text) marks.set(i);
      if (t + 1 < tailCount) ++t;
    }
  }
  return marks;
}

}  // namespace

int ZORVadEnumString::CalcConcatenation(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return 0;
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  const std::size_t pairs = std::size_t{x.mTexts.Count()} * y.mTexts.Count();
  if (CanMark(pairs)) return Keep(MarkPairs(mTexts, x.mTexts, y.mTexts));
  Texts candidates(pairs);
  ZORString candidate;
  for (const ZORString* const head : x.mTexts.All()) {
    for (const ZORString* const tail : y.mTexts.All()) {
      if (candidates.Count() == zor::kSetLimit) return 0;  // too many results: nothing is narrowed
      candidate.Concatenate(*head, *tail);                 // NOLINT(bugprone-use-after-move): whatever it was
      candidates.Insert(std::move(candidate));             // which leaves it its memory if the text is there
    }
  }
  return Narrow(std::move(candidates));
}

int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVadEnumString&, const ZORVadEnumString&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVadEnumString&, ZORVadEnumString&) const { return 0; }

int ZORVadEnumString::CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcConcatenation(a, b); });
}

// The inverses pass on a contradiction and narrow nothing else.
int ZORVadEnumString::CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcFirstInverseConcatenation(a, b); });
}

int ZORVadEnumString::CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcSecondInverseConcatenation(a, b); });
}
