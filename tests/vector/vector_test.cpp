// The vector beside a plain account of its places, and what of it a walk does not show.
#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <deque>
#include <limits>
#include <random>
#include <set>
#include <string>
#include <utility>

#include "tests/allocation/memory.h"
#include "vector/ZORISVectorImp_String.h"

namespace {

using namespace zor::test;
using Vector = ZORISVectorImp_String;
using Iterator = ZORISVectorIteratorImp_String;
using Strings = std::vector<ZORString*>;

struct Seen {
  Strings all, wanted;
};
int IsWanted(const ZORString& s, void* seen) {
  auto& [all, wanted] = *static_cast<Seen*>(seen);
  all.push_back(const_cast<ZORString*>(&s));
  return std::count(wanted.begin(), wanted.end(), &s) != 0 ? 2 : 0;
}

// A null place orders before every string.
int Order(const ZORString* s) { return s != nullptr ? *s->CastToCharPtr() : 0; }

// A vector and the places that it must have, changed alike. Owns every string that either still has.
class Walk {
 public:
  Walk(Vector&& start, bool hasArray)
      : mIsGood(start.Good()), mHasArray(hasArray), mLimit(start.Limit()), mTop(start.Top()) {
    mVector.Swap(start);
    if (mHasArray) mPlaces.resize(mLimit);
  }
  Walk(const Walk&) = delete;
  ~Walk() {
    for (ZORString* s : mStrings) delete s;
  }

  void Step() {
    mIsRefused = Random(4) == 0;
    const int del = Flag();
    // A vector out of order is changed by place alone.
    const unsigned int action = IsInOrder() ? Random(100) : 60 + Random(40);
    const bool grows = mSteps++ % 1000 < 500;
    if (action < (grows ? 40 : 15)) {
      Add(&Vector::Add);
    } else if (action < (grows ? 50 : 20)) {
      Add(&Vector::AddUnique);
    } else if (action < 60) {
      const ZORString sought(ZORChar(Letter()), 1);
      const unsigned int pos = mVector.Find(&sought);
      Expect(DetachAt(pos, 1, del), [&] { return mVector.Detach(&sought, del); });
    } else if (action < 75) {
      ZORString* const s = New();
      const unsigned int pos = IsInOrder() && Random(16) != 0 ? CountUpTo(Order(s)) : Number();
      Expect(AddAt(s, pos), [&] { return mVector.AddAt(s, pos); });
    } else if (action < 88) {
      const unsigned int pos = Number(), count = Random(8) != 0 ? 1 : Number();
      Expect(DetachAt(pos, count, del), [&] { return mVector.DetachAt(pos, count, del); });
    } else if (action < 94) {
      const unsigned int wanted = Number();
      Expect(Grow(wanted), [&] { return mVector.Resize(wanted); });
    } else if (action < 98) {
      Replace();
    } else {
      const unsigned int stop = Random(3) == 0 ? mLimit : Number(), start = stop == mLimit ? 0 : Number();
      Flush(del, stop, start);
      Expect(0, [&] { return stop == mLimit ? mVector.Flush(del) : mVector.Flush(del, stop, start), 0; });
    }
    ComparePlaces();
    CompareVisits();
    if (IsInOrder()) CompareSearches();
  }

 private:
  unsigned int Random(unsigned int below) { return static_cast<unsigned int>(mRandom() % below); }
  int Flag() { return static_cast<int>(Random(2)); }
  char Letter() { return static_cast<char>('a' + Random(26)); }
  unsigned int Number() { return Random(10) == 0 ? UINT_MAX - Random(3) : Random(mLimit + 3); }
  ZORString* New() { return *mStrings.insert(new ZORString(ZORChar(static_cast<char>(Letter() | 1)), 1)).first; }

  bool IsInOrder() const {
    return std::is_sorted(mPlaces.begin(), mPlaces.begin() + (mHasArray ? mTop : 0),
                          [](const ZORString* a, const ZORString* b) { return Order(a) < Order(b); });
  }
  unsigned int CountUpTo(int order) const {
    return mHasArray ? std::count_if(mPlaces.begin(), mPlaces.begin() + mTop,
                                     [&](const ZORString* s) { return Order(s) <= order; })
                     : 0;
  }

  int Grow(unsigned int wanted) {
    if (wanted <= mLimit || !mHasArray) return 0;
    const unsigned int extra = mVector.NextDelta(wanted - mLimit);
    if (extra == 0 || mIsRefused || std::uint64_t{mLimit} + extra >= kTooMuch / sizeof(void*)) return 0;
    mPlaces.resize(mLimit += extra);
    return 1;
  }
  int AddAt(ZORString* s, unsigned int pos) {
    if (!mHasArray || (pos >= mLimit && Grow(pos + 1) == 0) || (mTop == mLimit && Grow(mLimit + 1) == 0)) return 0;
    mTop = std::max(mTop, pos);
    mPlaces.erase(mPlaces.begin() + mTop++);
    mPlaces.insert(mPlaces.begin() + pos, s);
    return 1;
  }
  void Add(int (Vector::*add)(ZORString*)) {
    ZORString* const s = New();
    const unsigned int behind = CountUpTo(Order(s));
    const bool isThere = behind != CountUpTo(Order(s) - 1) && add == &Vector::AddUnique;
    Expect(isThere ? 1 : AddAt(s, behind), [&] { return (mVector.*add)(s); });
  }
  int DetachAt(unsigned int pos, unsigned int count, int del) {
    if (!mHasArray || pos >= mLimit) return 0;
    const unsigned int end = pos + std::min(count, mLimit - pos), last = pos < mTop ? std::min(end, mTop) : end;
    for (unsigned int i = pos; i < end; ++i)
      if (del != 0 || i < last) Drop(i, del);
    if (pos >= mTop) return 1;
    std::rotate(mPlaces.begin() + pos, mPlaces.begin() + last, mPlaces.begin() + mTop);
    mTop -= last - pos;
    return 1;
  }
  void Flush(int del, unsigned int stop, unsigned int start) {
    for (unsigned int i = start; i < std::min<std::size_t>(stop, mPlaces.size()); ++i) Drop(i, del);
    mTop = 0;
  }
  void Drop(unsigned int pos, int del) {
    if (del != 0 && mPlaces[pos] != nullptr) {
      mStrings.erase(mPlaces[pos]);
      mDeleted.push_back(mPlaces[pos]);
    }
    mPlaces[pos] = nullptr;
  }

  template <class Call>
  void Expect(int answer, Call call) {
    std::vector<void*> deleted;
    deleted.reserve(mDeleted.size() + 1);
    sDeletions = &deleted;
    EXPECT_EQ(answer, RunRefused(mIsRefused ? 0 : kNone, call));
    sDeletions = nullptr;
    EXPECT_EQ(mDeleted, deleted);
    mDeleted.clear();
  }

  // Goes on with a copy, when one can be had.
  void Replace() {
    Vector copy(3, 2u);
    const bool assigns = Flag() != 0;
    Expect(0, [&] {
      if (assigns) return copy = mVector, 0;
      Vector made(mVector);
      return copy.Swap(made), 0;
    });
    EXPECT_EQ(mVector.Good() != 0 && !mIsRefused, copy.Good() != 0);
    if (copy.Good() != 0) {
      mVector.Swap(copy);
    } else if (mVector.Good() != 0) {
      EXPECT_EQ(assigns ? 0 : mLimit, copy.Limit());
      EXPECT_EQ(assigns ? 0 : mTop, copy.Top());
    }
  }

  void ComparePlaces() {
    EXPECT_EQ(mLimit, mVector.Limit());
    EXPECT_EQ(mTop, mVector.Top());
    EXPECT_EQ(mTop, mVector.Count());
    EXPECT_EQ(mTop == 0, mVector.IsEmpty() != 0);
    EXPECT_EQ(mIsGood, mVector.Good());
    EXPECT_EQ(mIsGood, std::as_const(mVector).Good());
    EXPECT_EQ(0, mVector.Resize(mLimit));
    for (unsigned int i = 0; i < mPlaces.size(); ++i) EXPECT_EQ(mPlaces[i], mVector[i]) << i;
  }

  void CompareVisits() {
    const unsigned int top = mVector.Top(), first = Number(), last = Number();
    const unsigned int end = std::min<std::size_t>(last, mPlaces.size()), start = std::min(first, end);
    const Strings range(mPlaces.begin() + start, mPlaces.begin() + end);
    Strings strings, walked;
    std::remove_copy(range.begin(), range.end(), std::back_inserter(strings), nullptr);
    Seen each, before, behind, all;
    std::sample(strings.begin(), strings.end(), std::back_inserter(before.wanted), Random(3), mRandom);
    const Strings wanted = behind.wanted = all.wanted = before.wanted;
    const auto visit = [](ZORString& s, void* seen) { IsWanted(s, seen); };
    mVector.ForEach(visit, &each, first, last);
    EXPECT_EQ(strings, each.all);
    EXPECT_EQ(wanted.empty() ? nullptr : wanted.back(), mVector.LastThat(IsWanted, &behind, first, last));
    EXPECT_EQ(strings, behind.all);
    EXPECT_EQ(wanted.empty() ? nullptr : wanted.front(), mVector.FirstThat(IsWanted, &before, first, last));
    if (!wanted.empty()) strings.erase(std::find(strings.begin(), strings.end(), wanted[0]) + 1, strings.end());
    EXPECT_EQ(strings, before.all);
    for (Iterator i(mVector, start, end); i;) walked.push_back(i++);
    EXPECT_EQ(range, walked);

    // Without a range, all elements.
    EXPECT_EQ(mVector.FirstThat(IsWanted, &all, 0, top), mVector.FirstThat(IsWanted, &all));
    EXPECT_EQ(mVector.LastThat(IsWanted, &all, 0, top), mVector.LastThat(IsWanted, &all));
    each.all.clear(), all.all.clear();
    mVector.ForEach(visit, &each), mVector.ForEach(visit, &all, 0, top);
    EXPECT_EQ(each.all, all.all);
  }

  void CompareSearches() {
    const ZORString sought(ZORChar(Letter()), 1);
    const unsigned int none = mLimit + 1, behind = CountUpTo(Order(&sought)), first = CountUpTo(Order(&sought) - 1);
    const unsigned int upper = mHasArray && first < mTop ? first : none, lower = behind != 0 ? behind - 1 : none;
    const unsigned int found = mVector.Find(&sought);
    EXPECT_EQ(first < behind, found >= first && found < behind);
    EXPECT_TRUE(first < behind || found == none);
    EXPECT_EQ(first < behind ? first : none, mVector.ClusteredFind(&sought));
    EXPECT_EQ(first < behind ? found : lower, mVector.FindLowerBound(&sought, 0));
    EXPECT_EQ(first < behind ? found : upper, mVector.FindUpperBound(&sought, 0));
    EXPECT_EQ(behind != 0 ? CountUpTo(Order(mPlaces[lower]) - 1) : none, mVector.FindLowerBound(&sought, 1));
    EXPECT_EQ(upper, mVector.FindUpperBound(&sought, 1));
  }

  std::mt19937 mRandom{20261};
  Vector mVector;
  int mIsGood;
  bool mHasArray, mIsRefused = false;
  unsigned int mLimit, mTop;
  int mSteps = 0;
  Strings mPlaces;
  std::set<ZORString*> mStrings;
  std::vector<void*> mDeleted;
};

TEST(Vector, BesideItsPlaces) {
  ZORString text("a");
  Vector full(3, 2u);
  EXPECT_EQ(1, full.Add(&text));
  const auto walk = [](Vector&& start, bool hasArray, int steps = 3000) {
    Walk beside(std::move(start), hasArray);
    for (int step = 0; step < steps && !testing::Test::HasFailure(); ++step) {
      SCOPED_TRACE(step);
      beside.Step();
    }
  };
  walk(Vector(20, 20u), true);
  walk(Vector(0, 3u), true);
  walk(Vector(0, 0.3), true);
  walk(Vector(0, 1.0), true);
  walk(Vector(5, 0u), true);
  walk(Vector(), false, 100);
  walk(RunRefused(0, [] { return Vector(20, 20u); }), false, 100);
  walk(RunRefused(0, [] { return Vector(20, 1.0); }), false, 100);
  walk(RunRefused(0, [&] { return Vector(full); }), false, 100);
}

// Which of equal strings is met is what halving meets first, not the first or the last of them.
TEST(Vector, WhichOfEquals) {
  const struct {
    const char *strings, *sought;
    unsigned int found;
  } rows[] = {{"aaaaaa", "a", 2}, {"abbbbbbb", "b", 3}, {"aaabb", "b", 3},
              {"aabbb", "a", 0},  {"aaabbbb", "a", 1},  {"abccccc", "b", 1}};
  for (const auto& row : rows) {
    std::deque<ZORString> strings;
    Vector v(20, 20u);
    for (const char* c = row.strings; *c != 0; ++c) v.Add(&strings.emplace_back(ZORChar(*c), 1));
    const ZORString sought(row.sought);
    EXPECT_EQ(row.found, v.Find(&sought)) << row.sought << " in " << row.strings;
  }
}

// A vector that grows is no sooner full than its limit says, and the rows that follow say by how much it grows.
TEST(Vector, Constructors) {
  const Vector none, stepped(20, 20u), scaled(7, 0.5), wrapped(UINT_MAX, 20u), huge(UINT_MAX - 1, 1u);
  const Vector* const vectors[] = {&none, &stepped, &scaled, &wrapped, &huge};
  const unsigned int limits[] = {0, 21, 8, 0, UINT_MAX}, deltas[] = {0, 20, 0, 20, 1};
  for (int i = 0; i < 5; ++i) {
    EXPECT_EQ(limits[i], vectors[i]->Limit()) << i;
    EXPECT_EQ(deltas[i], vectors[i]->GetDelta()) << i;
    EXPECT_EQ(i == 4 ? 0 : 1, vectors[i]->Good()) << i;
  }
}

TEST(Vector, NextDelta) {
  constexpr unsigned int kMost = UINT_MAX;
  constexpr double kInfinite = std::numeric_limits<double>::infinity();
  const struct {
    unsigned int size, delta;
    double ratio;  // of a vector of delta 0
    unsigned int needed, answer;
  } rows[] = {
      // clang-format off
      {20, 20, 0, 0, 0},   {20, 20, 0, 1, 20},   {20, 20, 0, 20, 20},      {20, 20, 0, 21, 40},
      {20, 7, 0, 20, 21},  {kMost, 3, 0, 4, 6},  {20, 20, 0, kMost, kMost},

      {20, 0, 1.0, 1, 21}, {20, 0, 1.0, 22, 63}, {20, 0, 0.5, 1, 10},      {20, 0, 0.5, 11, 25},
      {20, 0, 2.5, 1, 52}, {20, 0, 0.01, 3, 3},  {20, 0, 0.0, 1, 21},      {20, 0, -2.0, 1, 21},
      {0, 0, 0.5, 3, 3},   {0, 0, 0.5, 4, 5},    {kMost, 0, 1.0, 1, 1},    {kMost, 0, 1.0, 3, 4},
      {20, 0, 1e300, 1, kMost}, {20, 0, kInfinite, 1, kMost}, {20, 0, 1.0, kMost, kMost},
      // clang-format on
  };
  for (const auto& row : rows) {
    Vector stepped(row.size, row.delta), scaled(row.size, row.ratio), copy;
    Vector& v = row.delta != 0 ? stepped : scaled;
    copy = v;
    EXPECT_EQ(row.answer, v.NextDelta(row.needed)) << row.size << ' ' << row.delta << ' ' << row.ratio;
    EXPECT_EQ(row.answer, copy.NextDelta(row.needed));
    EXPECT_EQ(row.answer, Vector(v).NextDelta(row.needed));
  }
  EXPECT_EQ(0u, Vector(20, 0u).NextDelta(1));
}

TEST(Vector, AssignsNothingButTheFlagOfOneThatIsNotGood) {
  ZORString a("a");
  Vector v(20, 20u), empty = RunRefused(0, [] { return Vector(3, 2u); });
  v.Add(&a);
  const Vector& self = v;
  RunRefused(0, [&] { v = self; });
  EXPECT_TRUE(v.Good() != 0 && v[0] == &a);
  v = empty;
  EXPECT_TRUE(v.Good() == 0 && v.Count() == 1 && v.Limit() == 21 && v[0] == &a);
  EXPECT_EQ(0, Vector(v).Good());
  EXPECT_EQ(nullptr, Iterator(v).Current());
  v = Vector();
  EXPECT_TRUE(v.Good() != 0 && v.Limit() == 0);
}

TEST(Vector, Iterators) {
  ZORString texts[5];
  Vector v(20, 20u);
  for (unsigned int i = 1; i < 5; ++i) v.AddAt(&texts[i], i - 1);
  const auto expect = [&](std::ptrdiff_t first, std::ptrdiff_t last, Iterator& i) {
    for (; first <= last; ++i) EXPECT_EQ(&texts[first++], i.Current());
    EXPECT_EQ(nullptr, i++);  // moves on at the end too
    EXPECT_EQ(0, static_cast<int>(i));
    i.Restart();
  };
  Iterator all(v), range(v, 1, 3);
  expect(2, 3, range);
  EXPECT_EQ(&texts[3], ++range);
  range.Restart(2, 4);
  expect(3, 4, range);
  Iterator copy(range);
  expect(3, 4, copy);
  v.AddAt(&texts[0], 0);  // the places are read now, the end was fixed before
  expect(0, 3, all);
  range = all;
  expect(0, 3, range);
}

}  // namespace
