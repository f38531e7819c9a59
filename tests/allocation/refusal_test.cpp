// Memory that cannot be had, one allocation after the other: where null or 0 is promised it comes, nothing leaks and
// nothing is half changed; a text or a set that cannot be had ends the process with a message.
#include <gtest/gtest.h>

#include <climits>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <new>
#include <string>
#include <utility>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "module/InitModule.h"

namespace {

constexpr int kNone = -1;
int sRefused = kNone;  // how many can be had before one is refused
bool sWasRefused = false;
std::ptrdiff_t sLive = 0;

void* Allocate(std::size_t size) {
  void* const memory = std::malloc(size);
  if (memory == nullptr) std::abort();
  ++sLive;
  return memory;
}

void Free(void* memory) {
  if (memory != nullptr) --sLive;
  std::free(memory);
}

// Only what asks for an answer is refused; the rest could not tell.
void* AllocateOrRefuse(std::size_t size) {
  if (sRefused != kNone && sRefused-- == 0) {
    sWasRefused = true;
    return nullptr;
  }
  return Allocate(size);
}

}  // namespace

void* operator new(std::size_t size) { return Allocate(size); }
void* operator new[](std::size_t size) { return Allocate(size); }
void* operator new(std::size_t size, const std::nothrow_t&) noexcept { return AllocateOrRefuse(size); }
void* operator new[](std::size_t size, const std::nothrow_t&) noexcept { return AllocateOrRefuse(size); }
void operator delete(void* memory) noexcept { Free(memory); }
void operator delete[](void* memory) noexcept { Free(memory); }
void operator delete(void* memory, std::size_t) noexcept { Free(memory); }
void operator delete[](void* memory, std::size_t) noexcept { Free(memory); }

namespace {

using Single = ZORVadSingleString;
using Set = ZORVadEnumString;

template <class Run>
void RunRefused(int number, Run run) {
  sRefused = number;
  sWasRefused = false;
  run();
  sRefused = kNone;
}

// Refuses each allocation of run in turn, the last time none; run must leave nothing allocated. Answers how many
// allocations one run makes.
template <class Run>
int RefuseEach(Run run) {
  for (int number = 0;; ++number) {
    SCOPED_TRACE(number);
    const std::ptrdiff_t live = sLive;
    RunRefused(number, run);
    EXPECT_EQ(sLive, live);
    if (!sWasRefused) return number;
  }
}

std::string Form(const ZORVaDoObject& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

// The classes never free their descriptors.
template <class Class>
void DeleteDescriptor() {
  delete std::exchange(Class::sDescriptor, nullptr);
}

// Each class makes its descriptor, or answers null and has none, not even the one that it had.
template <class Class>
void RefuseDescriptor() {
  const std::unique_ptr<const ZORVaDoObjectDescriptor> former(Class::MakeDescriptor());
  EXPECT_EQ(RefuseEach([] {
              const auto* const descriptor = Class::MakeDescriptor();
              EXPECT_EQ(descriptor == nullptr, sWasRefused);
              EXPECT_EQ(descriptor, Class::sDescriptor);
              DeleteDescriptor<Class>();
            }),
            1);
}

TEST(Refused, Descriptors) {
  RefuseDescriptor<ZORVaDoString>();
  RefuseDescriptor<Single>();
  RefuseDescriptor<Set>();
}

TEST(Refused, InitModule) {
  RefuseEach([] {
    ZORVaDoModuleManager manager;
    ZORVaDoModule module(ZORString("ZORVadStrings"));
    EXPECT_EQ(InitModule(&module, &manager), 1);
    std::vector<const ZORVaDoObjectDescriptor*> expected;
    if (Single::sDescriptor != nullptr) expected.push_back(Single::sDescriptor);
    if (Set::sDescriptor != nullptr) expected.push_back(Set::sDescriptor);
    EXPECT_EQ(module.GetDescriptors(), expected);
    EXPECT_EQ(expected.size() < 2 || ZORVaDoString::sDescriptor == nullptr, sWasRefused);
    DeleteDescriptor<ZORVaDoString>();
    DeleteDescriptor<Single>();
    DeleteDescriptor<Set>();
  });
}

// Every class that streams know by name.
TEST(Refused, Factories) {
  for (const char* name : {"ZORVadSingleString", "ZORVadSingleString_Descriptor", "ZORVadEnumString",
                           "ZORVadEnumString_Descriptor", "ZORVaDoString_Descriptor", "ZORVadSingleInteger",
                           "ZORVadIntervalInteger", "ZORVadEnumInteger", "ZORVadSingleBoolean"}) {
    SCOPED_TRACE(name);
    const auto* const record = ZORStreamableClass::Find(name);
    ASSERT_NE(record, nullptr);
    int built = 0;
    const int allocations = RefuseEach([&] {
      const std::unique_ptr<ZORStreamable> object(record->Build());
      built += object != nullptr ? 1 : 0;
    });
    EXPECT_EQ(built, allocations);  // all but the one whose first allocation is refused
  }
}

// What is missing reads as null, and a value without its text as Nil.
TEST(Refused, Streams) {
  ZORopstream out;
  Single("text").Write(out);
  RefuseEach([&] {
    ZORipstream in(out.Bytes());
    Single value;
    value.Read(in);
    EXPECT_EQ(Form(value), sWasRefused ? "Nil" : "\"text\"");
    EXPECT_EQ(in.Fail(), sWasRefused);
  });
  const Single stored("text");
  ZORopstream pointers;
  pointers.WriteObjectPointer(&stored);
  RefuseEach([&] {
    ZORipstream in(pointers.Bytes());
    const std::unique_ptr<ZORStreamable> object(in.ReadObjectPointer());
    EXPECT_EQ(in.Fail(), sWasRefused);
    const auto* const value = Single::DynamicCast(ZORVaDoBase::FromStream(object.get()));
    EXPECT_TRUE(value == nullptr || Form(*value) == (sWasRefused ? "Nil" : "\"text\""));
  });
}

// A set that was read in part keeps none of it.
TEST(Refused, StoredSets) {
  Set both("a"), value;
  both.Insert("b");
  ZORopstream texts;
  both.Write(texts);
  for (const int number : {0, 2}) {  // the characters of the first text, of the second
    ZORipstream in(texts.Bytes());
    RunRefused(number, [&] { value.Read(in); });
    EXPECT_TRUE(sWasRefused && in.Fail() && value.IsNil() && value.Count() == 0) << number;
  }
}

// A run over the operations that build texts and sets, told by the values that it ends with.
std::string Operate() {
  const std::string many(40, 'a');
  Set x(many.c_str()), y("A"), z, folded, greatest, next, read;
  Single s(many.c_str()), t("B"), u, cut;
  for (int i = 0; i < 4; ++i) x.InsertExactValue((many + std::to_string(i)).c_str());
  y.SetUpperBound(("b" + many).c_str());
  z.CalcConcatenation(x, y);
  folded.CalcUpperValue(z);
  greatest.CalcMaxValue(x, folded);
  next.CalcNextValue(z);
  z.Unite(next);
  z.Intersect(next);
  x.CalcInverseNextValue(y);
  u.CalcConcatenation(s, t);
  t.CalcStringRepresentation(u);
  s.CalcNextValue(u);
  ZORVadSingleInteger from, to;
  from.SetExactValue(1);
  to.SetExactValue(35);
  cut.CalcSubString(u, from, to);
  const std::string form = "{ \"c\", \"" + many + "\" }";
  ZORistrstream in(form.c_str(), 0);
  read.InputValue(in);
  Set copy(x);
  copy.RemoveExactValue(x.GetUpperBound());
  read.Unite(copy);
  std::string told;
  for (const ZORVaDoObject* value :
       std::initializer_list<const ZORVaDoObject*>{&x, &y, &z, &folded, &greatest, &next, &read, &s, &t, &u, &cut})
    told += Form(*value) + '\n';
  return told;
}

// Every text and every place for one is wanted: without it the process ends. A part that was refused and not needed
// after all makes no difference.
TEST(RefusedDeathTest, TextsAndPlaces) {
  InitStrings();
  const std::string expected = Operate();
  const auto endsWell = [](int status) {
    return testing::ExitedWithCode(0)(status) || testing::KilledBySignal(SIGABRT)(status);
  };
  int allocations = 0;
  RunRefused(INT_MAX, [&] { Operate(), allocations = INT_MAX - sRefused; });
  const auto refuse = [&](int number) {
    std::string told;
    RunRefused(number, [&] { told = Operate(); });
    if (told == expected) std::fputs("no difference\n", stderr);
    std::exit(told == expected ? 0 : 1);
  };
  EXPECT_GT(allocations, 100);
  for (int number = 0; number < allocations; ++number)
    EXPECT_EXIT(refuse(number), endsWell, "ZORString: out of memory|no memory for a set of texts|no difference")
        << number;
}

template <class Run>
void ExpectDeath(Run run, const char* message) {
  EXPECT_DEATH(RunRefused(0, run), message);
}

TEST(RefusedDeathTest, OneByOne) {
  const ZORString text('a', 40);
  Set full("a");
  for (int i = 0; full.Count() < 21; ++i) full.Insert(std::to_string(i).c_str());
  ExpectDeath([] { new ZORString; }, "ZORString: out of memory");
  ExpectDeath([&] { ZORString copy(text); }, "ZORString: out of memory");
  ExpectDeath([&] { ZORString().Append(text); }, "ZORString: out of memory");
  ExpectDeath([&] { Single value(text); }, "ZORString: out of memory");
  ExpectDeath([] { Set value("a"); }, "no memory for a set of texts");
  ExpectDeath([&] { Set copy(full); }, "no memory for a set of texts");
}

}  // namespace
