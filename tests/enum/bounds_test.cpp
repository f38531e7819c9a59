// Bounds of sets of texts and texts one at a time, with the limit of 256.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

// clang-format off
const TextRow kSetLowerBound[] = {
  {"the bound comes in",                  "{b,d}",   "c",     0,  "{c,d}"},
  {"the max stays",                       "{b,d,Max}", "c",   0,  "{c,d,Max}"},
  {"it is listed once",                   "{b,d}",   "d",     0,  "{d}"},
  {"also of a full value",                "Max",     "c",     0,  "{c,Max}"},
  {"not where nothing is listed",         "Any",     "c",     0,  "Any"},
  {"nor there",                           "Nil",     "c",     0,  "Nil"},
};
const TextRow kSetUpperBound[] = {
  {"the bound comes in",                  "{b,d}",   "c",     0,  "{b,c}"},
  {"the max goes",                        "{b,d,Max}", "c",   0,  "{b,c}"},
  {"the greatest is listed and held",     "{b,d}",   "z*255", 0,  "{b,d,z*255,Max}"},
  {"from nothing",                        "Nil",     "c",     0,  "{c}"},
};
const TextRow kInsertExact[] = {
  {"an open value takes nothing",         "Any",     "a",     0,  "Any"},
  {"nor does a full one",                 "Max",     "a",     0,  "Max"},
  {"nil becomes the text",                "Nil",     "a",     0,  "{a}"},
  {"listed, the max goes",                "{a,Max}", "a",     0,  "{a}"},
};
const TextRow kRemoveExact[] = {
  {"the only text",                       "{a}",     "a",     1,  "Nil"},
  {"the max remains",                     "{a,Max}", "a",     1,  "Max"},
  {"one of equal texts",                  "{a,a,b}", "a",     1,  "{a,b}"},
  {"of a full value",                     "Max",     "z*255", 0,  "Max"},
  {"of an open value",                    "Any{a}",  "a",     0,  "Any{a}"},
};
// clang-format on

TEST(EnumBounds, Texts) {
  CheckTexts(kSetLowerBound, [](auto& z, auto& text) { return z.SetLowerBound(text), 0; });
  CheckTexts(kSetUpperBound, [](auto& z, auto& text) { return z.SetUpperBound(text), 0; });
  CheckTexts(kInsertExact, [](auto& z, auto& text) { return z.InsertExactValue(text), 0; });
  CheckTexts(kRemoveExact, ZOR_OPERATION(RemoveExactValue));
}

TEST(EnumBounds, Neighbours) {
  const HeldSet held("{b,d,f}");
  std::string next, previous;
  for (const char* text : {"a", "b", "c", "d", "e", "f", "g"}) {
    next += Plain(held.value.GetNextExactValue(text));
    previous += Plain(held.value.GetPrevExactValue(text));
  }
  EXPECT_EQ(next, "bbddefg");
  EXPECT_EQ(previous, "abbddfg");
}

// The 256th text still goes in, one more opens the value, also one that is listed; larger sets take more.
TEST(EnumBounds, Limit) {
  for (const char* text : {"b", "a7"}) {
    HeldSet full(Many(256)), almost(Many(255)), larger(Many(257));
    almost.value.InsertExactValue("b");
    full.value.InsertExactValue(text);
    larger.value.InsertExactValue(text);
    EXPECT_TRUE(almost.Now().tag == kExact && almost.Now().texts.size() == 256);
    EXPECT_EQ(full.Now(), Set("Any"));
    EXPECT_EQ(larger.Now().texts.size(), std::string("b") == text ? 258u : 257u);
    full.value.InsertExactValue("b");
    EXPECT_EQ(full.Now(), Set("Any"));
  }
}

}  // namespace
}  // namespace zor::test
