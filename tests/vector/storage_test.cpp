#include <climits>
#include <limits>
#include <new>

#include "tests/vector/strings.h"

namespace {

constexpr std::size_t kTooMuch = std::size_t{1} << 30;  // no test may ask the machine for that
int sAllocationsLeft = -1;                              // below 0: any number

// Meanwhile so many arrays can be had and no more.
struct Allocations {
  explicit Allocations(int left) { sAllocationsLeft = left; }
  ~Allocations() { sAllocationsLeft = -1; }
};

}  // namespace

void* operator new[](std::size_t size, const std::nothrow_t&) noexcept {
  if (size >= kTooMuch || sAllocationsLeft == 0) return nullptr;
  if (sAllocationsLeft > 0) --sAllocationsLeft;
  return ::operator new[](size);
}

namespace {

using Vector = ZORISVectorImp_String;

struct Row {
  const char* why;
  const char* before;
  int (*act)(Vector& v);
  int answer;
  const char* after;
  unsigned int limit = 21;
};

#define FULL "bcdefghijklmnopqrstuv"
const Row kChanges[] = {
    // clang-format off
    {"the 22nd string grows by delta",     FULL,      [](Vector& v) { return Add(v, 'a'); },                1, "a" FULL, 41},

    {"behind all, and growing",            FULL,      [](Vector& v) { return AddUnique(v, 'z'); },          1, FULL "z", 41},

    {"the places behind move up",          "abc",     [](Vector& v) { return AddAt(v, 'z', 1); },           1, "azbc"},
    {"at top",                             "abc",     [](Vector& v) { return AddAt(v, 'a', 3); },           1, "abca"},
    {"null places up to it count",         "a",       [](Vector& v) { return AddAt(v, 'c', 4); },           1, "a---c"},
    {"at the limit it grows",              "a",       [](Vector& v) { return AddAt(v, 'c', 21); },          1, "a--------------------c", 41},
    {"a full vector grows for any place",  FULL,      [](Vector& v) { return AddAt(v, 'z', 0); },           1, "z" FULL, 41},
    {"there is no place UINT_MAX",         "a",       [](Vector& v) { return AddAt(v, 'c', UINT_MAX); },    0, "a"},
    {"nor one before it",                  "a",       [](Vector& v) { return AddAt(v, 'c', UINT_MAX - 1); },0, "a"},

    {"the places behind move down",        "abc",     [](Vector& v) { return v.DetachAt(1, 1, 1); },        1, "ac"},
    {"a block",                            "abcdef",  [](Vector& v) { return v.DetachAt(1, 3, 1); },        1, "aef"},
    {"a count beyond top ends there",      "abcde",   [](Vector& v) { return v.DetachAt(3, 9, 1); },        1, "abc"},
    {"a count beyond all numbers too",     "abcde",   [](Vector& v) { return v.DetachAt(1, UINT_MAX, 1); }, 1, "a"},
    {"a count of 0 removes nothing",       "abc",     [](Vector& v) { return v.DetachAt(1, 0, 1); },        1, "abc"},
    {"from top nothing is to be removed",  "abc",     [](Vector& v) { return v.DetachAt(3, 50, 1); },       1, "abc"},
    {"the limit is no place",              "abc",     [](Vector& v) { return v.DetachAt(21, 1, 1); },       0, "abc"},

    {"a flush ends at the limit",          "abc",     [](Vector& v) { return v.Flush(1, UINT_MAX, 0), 1; }, 1, ""},

    {"no growth up to the limit",          "ab",      [](Vector& v) { return v.Resize(21); },               0, "ab"},
    {"growth is a multiple of delta",      "ab",      [](Vector& v) { return v.Resize(42); },               1, "ab", 61},
    {"no growth beyond all numbers",       "ab",      [](Vector& v) { return v.Resize(UINT_MAX); },         0, "ab"},
    // clang-format on
};

void ExpectVector(const Vector& v, const std::string& letters, unsigned int limit) {
  EXPECT_EQ(letters, Show(v));
  EXPECT_EQ(limit, v.Limit());
  EXPECT_EQ(v.Top(), v.Count());
  EXPECT_EQ(letters.empty(), v.IsEmpty());
  EXPECT_EQ(1, v.Good());
  ExpectNullBehindTop(v);
}

TEST(VectorStorage, Changes) {
  for (const Row& row : kChanges) {
    SCOPED_TRACE(row.why);
    Strings v{std::string(row.before)};
    if (row.limit != v.Limit()) {  // what cannot grow stays as it was
      Allocations none(0);
      EXPECT_EQ(0, row.act(v));
      ExpectVector(v, row.before, 21);
    }
    Allocations one(1);
    EXPECT_EQ(row.answer, row.act(v));
    ExpectVector(v, row.after, row.limit);
  }
}

TEST(VectorStorage, EqualStringsStandInTheOrderInWhichTheyCame) {
  Strings v("a");
  ZORString *first = New('b'), *second = New('b'), *third = New('b');
  v.Add(first);
  v.Add(second);
  Add(v, 'c');
  v.Add(third);
  EXPECT_EQ("abbbc", Show(v));
  EXPECT_EQ(first, v[1]);
  EXPECT_EQ(second, v[2]);
  EXPECT_EQ(third, v[3]);
}

TEST(VectorStorage, WithoutTheFlagStringsStayTheCallers) {
  Strings v("abcde"), owner("");
  for (unsigned int i = 0; i < 5; ++i) owner.Add(v[i]);
  EXPECT_EQ(1, v.Detach(v[1], 0));
  EXPECT_EQ(1, v.DetachAt(1, 2, 0));
  v.Flush(0);
  EXPECT_EQ("abcde", Show(owner));
}

TEST(VectorStorage, FlushOfAPartLeavesTheRestBehindTop) {
  Strings v("abcde");
  v.Flush(1, 2, 1);
  EXPECT_EQ(0u, v.Count());
  EXPECT_EQ("a-cde", Show(v, 0, 5));
  v.Flush(1, 1, 4);  // a range that is not in order
  EXPECT_EQ("a-cde", Show(v, 0, 5));
  EXPECT_EQ(1, v.DetachAt(2, 1, 1));
  EXPECT_EQ("a--de", Show(v, 0, 5));
  EXPECT_EQ(1, AddAt(v, 'z', 2));
  EXPECT_EQ("a-z", Show(v));
  EXPECT_EQ(1, v.DetachAt(1, 4, 1));  // deletes also behind top, and leaves nothing there to be deleted again
  EXPECT_EQ("a----", Show(v, 0, 5));
}

TEST(VectorStorage, Constructors) {
  const Vector none, stepped(20, 20u), scaled(7, 0.5), wrapped(UINT_MAX, 20u), huge(UINT_MAX - 1, 1u);
  ExpectVector(none, "", 0);
  ExpectVector(stepped, "", 21);
  ExpectVector(scaled, "", 8);
  ExpectVector(wrapped, "", 0);
  EXPECT_EQ(0u, none.GetDelta());
  EXPECT_EQ(20u, stepped.GetDelta());
  EXPECT_EQ(0u, scaled.GetDelta());
  EXPECT_EQ(0, huge.Good());
  EXPECT_EQ(UINT_MAX, huge.Limit());
}

TEST(VectorStorage, WithoutGrowthAFullVectorRefuses) {
  Vector none;
  Strings one(0, 0u);
  EXPECT_EQ(1, Add(one, 'b'));
  for (Vector* v : {&none, static_cast<Vector*>(&one)}) {
    EXPECT_EQ(0, Add(*v, 'a') + AddUnique(*v, 'c') + AddAt(*v, 'a', 0) + AddAt(*v, 'a', 1));
    EXPECT_EQ(0u, v->NextDelta(1));
  }
  EXPECT_EQ("b", Show(one));
}

TEST(VectorStorage, NextDelta) {
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
    Vector stepped(row.size, row.delta), scaled(row.size, row.ratio);
    EXPECT_EQ(row.answer, (row.delta != 0 ? stepped : scaled).NextDelta(row.needed))
        << row.size << ' ' << row.delta << ' ' << row.ratio << ' ' << row.needed;
  }
}

TEST(VectorStorage, CopiesShareTheStrings) {
  Strings v("abc");
  Vector target(3, 0.5);
  {
    const Vector copy(v);
    ExpectVector(copy, "abc", 21);
    EXPECT_EQ(v[1], copy[1]);
    EXPECT_EQ(&target, &(target = copy));
  }
  ExpectVector(target, "abc", 21);
  EXPECT_EQ(v[1], target[1]);
  EXPECT_EQ(20u, target.NextDelta(1));
  {
    Allocations none(0);
    const Vector& self = target;
    target = self;
  }
  ExpectVector(target, "abc", 21);
  target = Vector(5, 1.0);
  EXPECT_EQ(6u, target.NextDelta(1));
  target = Vector();
  ExpectVector(target, "", 0);
}

// Whatever is asked of a vector without an array, nothing is there.
void ExpectNoPlaces(Vector& v) {
  const ZORString a("a");
  EXPECT_EQ(0, v.Good());
  EXPECT_EQ(0, std::as_const(v).Good());
  for (int answer :
       {Add(v, 'a'), AddUnique(v, 'a'), AddAt(v, 'a', 0), v.Resize(100), Detach(v, 'a'), v.DetachAt(0, 1, 1)})
    EXPECT_EQ(0, answer);
  for (unsigned int pos : {v.Find(&a), v.ClusteredFind(&a), v.FindLowerBound(&a, 1), v.FindUpperBound(&a, 1)})
    EXPECT_EQ(v.Limit() + 1, pos);
  v.ForEach([](ZORString&, void*) { ADD_FAILURE(); }, nullptr);
  EXPECT_EQ(nullptr, v.FirstThat([](const ZORString&, void*) { return 1; }, nullptr));
  EXPECT_EQ(nullptr, v.LastThat([](const ZORString&, void*) { return 1; }, nullptr));
  EXPECT_EQ(nullptr, ZORISVectorIteratorImp_String(v).Current());
  EXPECT_EQ(0, Vector(v).Good());
  v.Flush(1);
  EXPECT_EQ(0u, v.Count());
}

TEST(VectorStorage, AVectorWhoseArrayCannotBeHad) {
  Strings full("abc");
  Vector target(full);
  Allocations none(0);
  Vector stepped(20, 20u), scaled(20, 1.0), copy(full);
  EXPECT_EQ(3u, copy.Count());
  for (Vector* v : {&stepped, &scaled, &copy}) {
    EXPECT_EQ(21u, v->Limit());
    ExpectNoPlaces(*v);
  }
  target = full;
  EXPECT_EQ(0u, target.Limit());
  EXPECT_EQ(0u, target.Count());
  ExpectNoPlaces(target);

  sAllocationsLeft = -1;
  target = full;
  ExpectVector(target, "abc", 21);
  target = stepped;  // takes over the flag alone
  EXPECT_EQ(0, target.Good());
  EXPECT_EQ("abc", Show(target));
  EXPECT_EQ(0, Vector(target).Good());
  EXPECT_EQ(nullptr, ZORISVectorIteratorImp_String(target).Current());
  stepped = Vector();
  ExpectVector(stepped, "", 0);
}

}  // namespace
