// Two threads with values and networks of their own. The thread sanitizer watches them in a build of its own.
#include <gtest/gtest.h>

#include <thread>

#include "enum/ZORVadEnumString.h"
#include "host/ZORPrint.h"
#include "network/ZORNetwork.h"

namespace {

constexpr int kRounds = 50;

template <class Run>
void InTwoThreads(Run run) {
  std::thread other(run);
  run();
  other.join();
}

TEST(Threads, ValuesOfTheirOwn) {
  const zornet::Network keepsTheModuleInUse{zornet::Model()};
  InTwoThreads([] {
    for (int i = 0; i < kRounds; ++i) {
      ZORVadEnumString x("a"), y("b"), z;
      x.Insert(ZORString('z', 40));
      z.CalcConcatenation(x, y);
      ZORopstream out;
      out.WriteObjectPointer(&z);
      ZORipstream in(out.Bytes());
      const std::unique_ptr<ZORStreamable> read(in.ReadObjectPointer());
      const auto* const back = ZORVadEnumString::DynamicCast(ZORVaDoBase::FromStream(read.get()));
      ASSERT_NE(back, nullptr);
      EXPECT_EQ(back->GetDescriptor(), z.GetDescriptor());
      std::ostringstream shown;
      shown << *back << ZORVadSingleString("c");
      EXPECT_EQ(shown.str(), "{ \"ab\", \"" + std::string(40, 'z') + "b\" }\"c\"");
    }
  });
}

TEST(Threads, NetworksOfTheirOwn) {
  InTwoThreads([] {
    for (int i = 0; i < kRounds; ++i) {
      zornet::Model model;
      const zornet::Var x = model.TextSet("x", {"a", "b"}), y = model.TextSet("y", {"b", "c"}), z = model.Text("z");
      model.Post("str_ne", {x, y});
      model.Post("str_concat", {x, y, z});
      zornet::Network network(std::move(model));
      EXPECT_EQ(network.Search(9, [] { return true; }).solutions, 3U);
      EXPECT_EQ(network.Explain(z).narrowings.empty(), false);
    }
  });
}

}  // namespace
