// What makes the classes easy to use beside the standard library.
#include <gtest/gtest.h>

#include <sstream>

#include "enum/ZORVadEnumString.h"
#include "host/ZORPrint.h"
#include "module/InitModule.h"

namespace {

TEST(Conveniences, TextsFromAndToTheStandardLibrary) {
  for (const std::string& text : {std::string(), std::string(40, 'a'), std::string("a\0b", 3)}) {
    const ZORString copied = text, viewed = std::string_view(text);
    EXPECT_EQ(copied.View(), text);
    EXPECT_EQ(std::string_view(viewed), text);
    EXPECT_EQ(ZORVadEnumString(text + 'a').GetLowerBound().View(), text + 'a');
  }
  EXPECT_EQ(ZORString(std::string_view()).GetLengthInChar(), 0);
}

TEST(Conveniences, AreShownOnStreams) {
  ZORVadEnumString set("b");
  set.Insert("a");
  std::ostringstream out;
  out << ZORString("a \"b\"") << ' ' << set << ' ' << ZORVadSingleInteger(3) << ' ' << ZORVadSingleBoolean();
  EXPECT_EQ(out.str(), "a \"b\" { \"a\", \"b\" } 3 Any");
}

static_assert(!std::is_constructible_v<ZORVadSingleInteger, ZORVaDoString::ZORStringStateTag>);
static_assert(!std::is_constructible_v<ZORVadSingleInteger, bool>);
static_assert(!std::is_constructible_v<ZORVadSingleInteger, std::int64_t>);
static_assert(!std::is_convertible_v<ZORLong, ZORVadSingleInteger>);

// As a program does that links the module and forgets it.
TEST(Conveniences, ADebugBuildMissesInitStrings) {
  ZORVaDoString::ZorVaDoStringMin = ZORString();
  testing::internal::CaptureStderr();
  ZORVadSingleString(), ZORVadEnumString();
  const std::string told = testing::internal::GetCapturedStderr();
  InitStrings();
#ifdef NDEBUG
  EXPECT_EQ(told, "");
#else
  EXPECT_EQ(told, "ZORVadStrings: a value is made before InitStrings() or InitModule was called\n");
#endif
}

}  // namespace
