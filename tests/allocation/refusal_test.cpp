// Memory that cannot be had, one allocation after the other: where null or 0 is promised it comes, nothing leaks and
// nothing is half changed; a text or a set that cannot be had ends the process with a message.
#include <gtest/gtest.h>
#include <unistd.h>

#include <climits>
#include <csignal>
#include <cstdio>
#include <fstream>
#include <functional>
#include <memory>
#include <string>
#include <thread>
#include <utility>

#include "enum/ZORVadEnumString.h"
#include "module/InitModule.h"
#include "tests/allocation/memory.h"

namespace {

using namespace zor::test;
using Single = ZORVadSingleString;
using Set = ZORVadEnumString;

std::string Form(const ZORVaDoObject& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

// The classes never free their descriptors. Answers whether there was one.
template <class Class>
bool DeleteDescriptor() {
  const std::unique_ptr<const ZORVaDoObjectDescriptor> former(std::exchange(Class::sDescriptor, nullptr));
  return former != nullptr;
}

std::size_t ResidentBytes() {
  std::size_t all = 0, resident = 0;
  std::ifstream("/proc/self/statm") >> all >> resident;
  return resident * static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
}

// A class makes its descriptor, or answers null and has none, not even the one that it had.
template <class Class>
void RemakeDescriptor() {
  static const typename Class::Descriptor kFormer("former", nullptr, 0);
  Class::sDescriptor = &kFormer;
  const auto* const made = Class::MakeDescriptor();
  EXPECT_EQ(made == nullptr, sWasRefused);
  EXPECT_EQ(made, Class::sDescriptor);
  DeleteDescriptor<Class>();
}

void Init() {
  ZORVaDoModuleManager manager;
  ZORVaDoModule module(ZORString("ZORVadStrings"));
  EXPECT_EQ(InitModule(&module, &manager), 1);
  std::vector<const ZORVaDoObjectDescriptor*> expected = {Single::sDescriptor, Set::sDescriptor};
  std::erase(expected, nullptr);
  EXPECT_EQ(module.GetDescriptors(), expected);
  const int made = DeleteDescriptor<ZORVaDoString>() + DeleteDescriptor<Single>() + DeleteDescriptor<Set>();
  EXPECT_EQ(made < 3, sWasRefused);
}

// Texts that threads make, delete and make again for each other share no memory, which does not grow.
TEST(Refused, KeptTexts) {
  if (!ZORString::KeepFreed(true)) GTEST_SKIP() << "freed texts are not kept under a sanitizer";
  constexpr std::size_t kThreads = 3, kTexts = 300000, kRounds = 4;
  std::vector<ZORString*> texts(kTexts);
  const auto each = [&](std::size_t thread, auto change) {
    for (std::size_t i = thread; i < kTexts; i += kThreads) change(i);
  };
  const auto remake = [&](std::size_t thread, std::size_t round) {
    each((thread + round) % kThreads, [&](std::size_t i) { delete texts[i]; });
    each((thread + round) % kThreads, [&](std::size_t i) { texts[i] = new ZORString(std::to_string(i * round)); });
  };
  const std::ptrdiff_t atFirst = sLive;
  const std::size_t before = ResidentBytes();
  for (std::size_t round = 1; round <= kRounds; ++round) {
    std::vector<std::thread> threads;
    for (std::size_t thread = 1; thread < kThreads; ++thread) threads.emplace_back(remake, thread, round);
    remake(0, round);
    for (std::thread& thread : threads) thread.join();
    for (std::size_t i = 0; i < kTexts; ++i) ASSERT_EQ(*texts[i], std::to_string(i * round).c_str());
  }
  EXPECT_EQ(sLive, atFirst);
  EXPECT_LT(ResidentBytes(), before + 2 * kTexts * sizeof(ZORString));
  ZORString::DeleteAll(texts.data(), texts.size());
  EXPECT_FALSE(ZORString::KeepFreed(false));
  EXPECT_EQ(sLive, atFirst);
  const std::unique_ptr<ZORString> counted(new ZORString("text"));
  EXPECT_EQ(sLive, atFirst + 1);
}

// A thread that deletes many texts gives most of their memory back.
TEST(Refused, DeletedTexts) {
  if (!ZORString::KeepFreed(true)) GTEST_SKIP() << "freed texts are not kept under a sanitizer";
  constexpr std::size_t kKept = std::size_t{128} * 65536;
  std::vector<ZORString*> texts(5 * kKept / sizeof(ZORString));
  for (ZORString*& text : texts) text = new ZORString("text");
  const std::size_t after = ResidentBytes();
  ZORString::DeleteAll(texts.data(), texts.size());
  EXPECT_LE(ResidentBytes(), after - 2 * kKept);
  ZORString::KeepFreed(false);
}

// Each allocation of a run is refused in turn, the last time none; the run leaves nothing allocated.
TEST(Refused, OneByOne) {
  InitStrings();
  const Single stored("text");
  ZORopstream texts, pointers;
  stored.Write(texts);
  pointers.WriteObjectPointer(&stored);
  int number = 0;
  std::vector<std::pair<std::string, std::function<void()>>> runs = {
      {"descriptor of strings", RemakeDescriptor<ZORVaDoString>},
      {"descriptor of single strings", RemakeDescriptor<Single>},
      {"descriptor of sets", RemakeDescriptor<Set>},
      {"module", Init},
      {"text from a stream",
       [&] {
         ZORipstream in(texts.Bytes());
         Single value;
         value.Read(in);
         EXPECT_EQ(Form(value), sWasRefused ? "Nil" : "\"text\"");
         EXPECT_EQ(in.Fail(), sWasRefused);
       }},
      {"object from a stream",
       [&] {
         ZORipstream in(pointers.Bytes());
         const std::unique_ptr<ZORStreamable> object(in.ReadObjectPointer());
         EXPECT_EQ(in.Fail(), sWasRefused);
         const auto* const value = Single::DynamicCast(ZORVaDoBase::FromStream(object.get()));
         EXPECT_TRUE(value == nullptr || Form(*value) == (sWasRefused ? "Nil" : "\"text\""));
       }},
  };
  for (const char* name : {"ZORVadSingleString", "ZORVadSingleString_Descriptor", "ZORVadEnumString",
                           "ZORVadEnumString_Descriptor", "ZORVaDoString_Descriptor", "ZORVadSingleInteger",
                           "ZORVadIntervalInteger", "ZORVadEnumInteger", "ZORVadSingleBoolean"})
    runs.emplace_back(name, [name, &number] {
      const std::unique_ptr<ZORStreamable> object(ZORStreamableClass::Find(name)->Build());
      EXPECT_EQ(object == nullptr, number == 0);  // what it has besides can be missing
    });
  for (const auto& [name, run] : runs) {
    number = 0;
    do {
      SCOPED_TRACE(testing::Message() << name << " without allocation " << number);
      const std::ptrdiff_t live = sLive;
      RunRefused(number, run);
      EXPECT_EQ(sLive, live);
      EXPECT_TRUE(sWasRefused || number > 0);
    } while (sWasRefused && ++number < 100);
  }
}

// A set that was read in part keeps none of it.
TEST(Refused, StoredSets) {
  Set both("a"), value;
  both.Insert("b");
  ZORopstream texts;
  both.Write(texts);
  for (const int number : {0, 3}) {  // the characters of the first text, of the second
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
  const auto refuse = [&](int number) {
    const std::string told = RunRefused(number, Operate);
    if (told == expected) std::fputs("no difference\n", stderr);
    std::exit(told == expected ? 0 : 1);
  };
  const auto endsWell = [](int status) {
    return testing::ExitedWithCode(0)(status) || testing::KilledBySignal(SIGABRT)(status);
  };
  const int allocations = RunRefused(INT_MAX, [] { return Operate(), INT_MAX - sRefused; });
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
  ExpectDeath([] { delete new ZORString; }, "ZORString: out of memory");
  ExpectDeath([&] { std::vector<ZORString>(1, text); }, "ZORString: out of memory");
  ExpectDeath([&] { ZORString().Append(text); }, "ZORString: out of memory");
  ExpectDeath([&] { Single value(text); }, "ZORString: out of memory");
  ExpectDeath([&] { std::vector<Set>(1, full); }, "no memory for a set of texts");
}

}  // namespace
