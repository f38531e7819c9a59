// Worked examples of the operations on sets of texts, which the model of them is measured by as well.
#include "tests/enum/sets.h"

namespace zor::test {
namespace {

ZORVaDoString& AsString(ZORVaDoString& value) { return value; }
ZORVadEnumString& AsSet(ZORVaDoString& value) { return *ZORVadEnumString::StaticCast(&value); }

using Single = Form<ZORVadSingleInteger, ZORVaDoInteger>;
using Interval = Form<ZORVadIntervalInteger, ZORVaDoInteger>;
using Numbers = Form<ZORVadEnumInteger, ZORVaDoInteger>;

// A text that operations take as such.
struct Word {
  struct Held {
    explicit Held(const Word& v) : value(Packed(v.text)) {}
    Word Now() const { return {Plain(value)}; }
    ZORString& Typed() { return value; }
    ZORString& Abstract() { return value; }
    ZORString value;
  };
  static Word Parse(std::string_view notation) { return {Unpacked(notation)}; }
  std::string text;
  bool operator==(const Word&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Word& v) { return out << v.text; }
};

// clang-format off
#define ON_SETS(Name)       [](auto& z, auto&... v) { return AsSet(z).Name(AsSet(v)...); }
#define ON_STRINGS(Name)    [](auto& z, auto&... v) { return AsString(z).Name(AsString(v)...); }
#define ON_TEXT(Name)       [](auto& z, auto& text) { return AsSet(z).Name(text), 0; }
#define WITHOUT_ANSWER(Name) [](auto& z, auto& x) { return z.Name(x), 0; }

#define Z2(Name)    ZOR_EXAMPLE(Name, 0, Set, Set)
#define X2(Name)    ZOR_EXAMPLE(Name, 1, Set, Set)
#define Z3(Name)    ZOR_EXAMPLE(Name, 0, Set, Set, Set)
#define X3(Name)    ZOR_EXAMPLE(Name, 1, Set, Set, Set)
#define ZS(Name)    ZOR_EXAMPLE(Name, 0, Set, Str)  // with a single string
#define XS(Name)    ZOR_EXAMPLE(Name, 1, Set, Str)
#define ZT(Name)    ZOR_EXAMPLE_OF(Name, ON_TEXT(Name), 0, Set, Word)
#define UNITE(X)    ZOR_EXAMPLE_OF(Unite, WITHOUT_ANSWER(Unite), 0, Set, X)
#define TYPED(Name, target, ...)  ZOR_EXAMPLE_OF(Name, ON_SETS(Name), target, __VA_ARGS__)     // in one form alone
#define ENTRY(Name, target, ...)  ZOR_EXAMPLE_OF(Name, ON_STRINGS(Name), target, __VA_ARGS__)
#define LENGTH(N)       ZOR_EXAMPLE(CalcLength, 1, Set, N)
#define FROM_LENGTH(N)  ZOR_EXAMPLE(CalcInverseLength, 0, Set, N)

const Example kExamples[] = {  // why, operation, operands, answer, target afterwards, answer to a second call
  {"full and a max beside texts",            Z2(CalcEqualValue), {"Max", "{a,Max}"}, 0, "Max"},
  {"full and no max",                        Z2(CalcEqualValue), {"Max", "{a}"}, 1, "Nil"},
  {"the target's max stays",                 Z2(CalcEqualValue), {"{a,b,Max}", "{a,b}"}, 0, "{a,b,Max}"},
  {"two max meet in no text",                Z2(CalcEqualValue), {"{a,Max}", "{b,Max}"}, 1, "Nil"},
  {"the operand's max takes no part",        Z2(CalcEqualValue), {"{a,b}", "{a,Max}"}, 1, "{a}"},
  {"1 also when it stands alone",            ZS(CalcEqualValue), {"{a}", "a"}, 1, "{a}", 1},
  {"the greatest tells nothing",             ZS(CalcEqualValue), {"{a,b}", "Max"}, 0, "{a,b}"},
  {"one space is no empty text",             ZS(CalcEqualValue), {"Min", "Min"}, 1, "Nil"},
  {"one text is taken, also beside a max",   XS(CalcInverseEqualValue), {"{x,Max}", "Any"}, 1, "x"},
  {"a full value holds any text",            XS(CalcInverseEqualValue), {"Max", "a"}, 0, "a"},
  {"nil takes a copy",                       UNITE(Set), {"Nil", "{a,Max}"}, 0, "{a,Max}"},
  {"a max beside texts is not taken",        UNITE(Set), {"{a}", "{b,Max}"}, 0, "{a,b}"},
  {"the greatest comes as a text",           UNITE(Str), {"{a}", "Max"}, 0, "{a,z*255}"},
  {"two max beside texts do not meet",       Z2(IsIntersected), {"{a,Max}", "{b,Max}"}, 0, "{a,Max}"},
  {"the greatest and a max",                 Z2(IsIntersected), {"Max", "{b,Max}"}, 1, "Max", 1},
  {"not the other way",                      Z2(IsIntersected), {"{b,Max}", "Max"}, 0, "{b,Max}"},
  {"a full value brings no text",            TYPED(Copy, 0, Set, Set), {"{a}", "Max"}, 0, "Max"},

  {"what lies above goes, and the max",      Z2(CalcLessOrEqualValue), {"{a,m,Max}", "{c}"}, 1, "{a}"},
  {"the greatest lies above all others",     Z2(CalcLessOrEqualValue), {"Max", "{z*255}"}, 1, "Nil"},
  {"one space is min",                       ZS(CalcLessOrEqualValue), {"{a}", "Min"}, 1, "Nil"},
  {"the bound comes in",                     X2(CalcInverseLessOrEqualValue), {"{c,m}", "{a,d}"}, 1, "{c,d}"},
  {"also when all lies below",               X2(CalcInverseLessOrEqualValue), {"{c}", "{a}"}, 1, "{c}"},
  {"the greatest comes in as a text",        X2(CalcInverseLessOrEqualValue), {"Max", "{a}"}, 1, "{z*255}"},
  {"a single x takes the bound",             XS(CalcInverseLessOrEqualValue), {"{c}", "a"}, 1, "c"},
  {"the max beside texts does not count",    XS(CalcInverseNotLessValue), {"{a,Max}", "b"}, 1, "Nil"},
  {"alone it does",                          XS(CalcInverseNotLessValue), {"Max", "z*255"}, 0, "z*255"},
  {"min compares as the empty text",         XS(CalcInverseNotLessValue), {"Min", "Min"}, 1, "Nil"},
  {"the greatest texts alone are compared",  Z2(CalcLessValue), {"{a,z}", "{m}"}, 1, "Nil"},
  {"max is below nothing",                   Z2(CalcLessValue), {"{a,Max}", "{b,Max}"}, 1, "Nil"},
  {"the bound of min is one space",          Z2(CalcLessValue), {"Min", "{ }"}, 1, "Nil"},
  {"no form for a single x",                 ENTRY(CalcLessValue, 0, Set, Str), {"{b}", "Nil"}, 0, "{b}"},
  {"nothing is cut",                         X2(CalcInverseNotLessAndUnequalValue), {"{m}", "{a,z}"}, 1, "Nil"},

  {"the union from the greater bound",       Z3(CalcMaxValue), {"Any", "{a,c}", "{b,d}"}, 1, "{b,c,d}", 1},
  {"two least texts make one space",         Z3(CalcMaxValue), {"Any", "Min", "Min"}, 1, "{ }", 1},
  {"the max of a set with texts is lost",    Z3(CalcMaxValue), {"{b,Max}", "{a,Max}", "{b}"}, 1, "{b}", 1},
  {"an open operand makes it open",          TYPED(CalcMaxValue, 0, Set, Set, Set), {"{a}", "Any", "{b}"}, 1, "Any"},
  {"but tells nothing as an entry",          ENTRY(CalcMaxValue, 0, Set, Set, Set), {"{a}", "Max", "Any"}, 0, "{a}"},
  {"the union up to the lesser bound",       Z3(CalcMinValue), {"Any", "{a,c}", "{b,d}"}, 1, "{a,b,c}", 1},
  {"the greatest adds nothing nor cuts",     Z3(CalcMinValue), {"{z}", "{b}", "Max"}, 1, "{b,z}", 1},
  {"both are the greatest",                  Z3(CalcMinValue), {"{a}", "Max", "Max"}, 1, "Max"},
  {"an open x below another bound",          X3(CalcFirstInverseMaxValue), {"{d}", "Any", "{b}"}, 0, "Any"},
  {"where y attains it, or may",             X3(CalcFirstInverseMaxValue), {"{d,Max}", "Any", "Any"}, 1, "{d,Max}"},
  {"x lies below y, which is not it",        X3(CalcFirstInverseMaxValue), {"{d}", "{a}", "{b}"}, 1, "Nil"},
  {"x lies above y, which is not it",        X3(CalcFirstInverseMinValue), {"{a}", "{d}", "{c}"}, 1, "Nil"},
  {"a space is added, z is replaced",        Z2(CalcNextValue), {"{q}", "{ab,Max}"}, 1, "{ab }", 1},
  {"at the limit z is dropped",              Z2(CalcNextValue), {"Any", "{a*253zz}"}, 1, "{a*252b}", 1},
  {"min has no case of its own",             Z2(CalcNextValue), {"Any", "Min"}, 1, "{ }", 1},
  {"filled with z, one for two",             X2(CalcInverseNextValue), {"{ab ,ac}", "Any"}, 1, "{abz*253}", 1},
  {"the empty text has none",                X2(CalcInverseNextValue), {"{, }", "{a}"}, 1, "Min", 1},
  {"a long one is not filled",               X2(CalcInverseNextValue), {"{a*255b}", "Any"}, 1, "{a*256}", 1},
  {"of the greatest: it and the one below",  X2(CalcInverseNextValue), {"Max", "{a}"}, 1, "{z*254y,Max}", 1},
  {"open",                                   TYPED(CalcInverseNextValue, 1, Set, Set), {"Any", "{a}"}, 1, "Any"},

  {"met with what z holds",                  Z3(CalcConcatenation), {"{ad,x,Max}", "{a,b}", "{c,d}"}, 1, "{ad,Max}"},
  {"the greatest decides",                   Z3(CalcConcatenation), {"{a}", "Max", "{b}"}, 1, "Max"},
  {"beside an open operand it does not",     Z3(CalcConcatenation), {"{a}", "Max", "Any"}, 0, "{a}"},
  {"a max beside texts takes no part",       Z3(CalcConcatenation), {"Any", "{a,Max}", "{b}"}, 1, "{ab}"},
  {"a full target lists nothing",            Z3(CalcConcatenation), {"Max", "{z}", "{z}"}, 1, "Nil"},
  {"no limit of length",                     Z3(CalcConcatenation), {"Any", "{a*200}", "{b*200}"}, 1, "{a*200b*200}"},
  {"parts learn of a contradiction alone",   ENTRY(CalcFirstInverseConcatenation, 1, Set, Set, Set), {"Nil", "{a}", "Any"}, 1, "Nil"},
  {"none for a single operand",              ENTRY(CalcConcatenation, 0, Set, Set, Str), {"{a}", "{a}", "Nil"}, 0, "{a}"},

  {"what is no fold goes",                   Z2(CalcLowerValue), {"{a,c,Max}", "{A,B,Max}"}, 1, "{a,Max}"},
  {"the greatest folds to itself",           Z2(CalcUpperValue), {"Any", "Max"}, 1, "Max"},
  {"a set with texts is not it",             Z2(CalcLowerValue), {"{a,Max}", "Max"}, 1, "Nil"},
  {"open tells nothing, also of a capital",  Z2(CalcLowerValue), {"{A}", "Any"}, 0, "{A}"},
  {"the first text alone is compared",       ZS(CalcLowerValue), {"{a,b}", "B"}, 1, "Nil"},
  {"one space is min, listed as such",       ZS(CalcLowerValue), {"Any", "Min"}, 1, "Min"},
  {"text by text, in another order",         X2(CalcInverseLowerValue), {"{a,b}", "{B,a}"}, 1, "Nil"},
  {"max takes no part",                      X2(CalcInverseUpperValue), {"{A,Max}", "{a}"}, 0, "{a}"},
  {"an open x where some text is a fold",    X2(CalcInverseLowerValue), {"{A,b}", "Any"}, 0, "Any"},
  {"where none is, but the greatest",        X2(CalcInverseLowerValue), {"{A,Max}", "Any"}, 0, "Any"},

  {"the bound comes in once, the max stays", ZT(SetLowerBound), {"{b,d,Max}", "d"}, 0, "{d,Max}"},
  {"the greatest is listed and held",        ZT(SetUpperBound), {"{b,d}", "z*255"}, 0, "{b,d,z*255,Max}"},
  {"listed, the max goes",                   ZT(InsertExactValue), {"{a,Max}", "a"}, 0, "{a}"},
  {"the max remains",                        ZT(RemoveExactValue), {"{a,Max}", "a"}, 0, "Max"},
  {"full no longer, the max stays",          ZT(Insert), {"Max", "a"}, 0, "{a,Max}"},
  {"the bound stays, none is added",         ZT(CutLower), {"{a,c}", "b"}, 0, "{c}"},
  {"below all texts, with the max",          ZT(CutUpper), {"{b,Max}", "a"}, 0, "Nil"},
  {"but for the greatest bound",             ZT(CutUpper), {"{a,Max}", "z*255"}, 0, "{a,Max}"},

  {"lengths of the texts, not of the max",   LENGTH(Numbers), {"{,ab,cd,Max}", "{ 2, 3 }"}, 1, "{ 2 }"},
  {"what z allows of an interval",           LENGTH(Interval), {"{,ab,cd}", "1..9"}, 1, "2"},
  {"it is there",                            LENGTH(Single), {"{,ab,cd}", "2"}, 0, "2"},
  {"another",                                LENGTH(Single), {"{ab,cd}", "3"}, 1, "Nil"},
  {"one length for all",                     LENGTH(Single), {"{ab,cd}", "Any"}, 1, "2"},
  {"the greatest lists nothing",             LENGTH(Numbers), {"Max", "Any"}, 1, "Nil"},
  {"an open value overwrites",               LENGTH(Single), {"Any", "3"}, 1, "Any", 1},
  {"nil, always with the answer 1",          LENGTH(Interval), {"Nil", "Nil"}, 1, "Nil", 1},
  {"texts of this length",                   FROM_LENGTH(Single), {"{a,ab,cd,Max}", "2"}, 1, "{ab,cd}", 1},
  {"of none",                                FROM_LENGTH(Single), {"{a,ab,cd}", "3"}, 1, "Nil"},
  {"of an interval, below 0 too",            FROM_LENGTH(Interval), {"{,a,ab}", "-1..0"}, 1, "Min", 1},
  {"of a set, with gaps",                    FROM_LENGTH(Numbers), {"{,a,ab}", "{ 0, 2 }"}, 1, "{,ab}", 1},
  {"the greatest has none",                  FROM_LENGTH(Single), {"Max", "255"}, 1, "Nil"},
  {"below 0 there is none",                  FROM_LENGTH(Single), {"{a}", "-1"}, 1, "Nil"},
  {"nil before open",                        FROM_LENGTH(Single), {"Any", "Nil"}, 1, "Nil"},
  {"an open value learns nothing else",      FROM_LENGTH(Single), {"Any", "-1"}, 0, "Any"},
  {"nor a nil one",                          FROM_LENGTH(Single), {"Nil", "1"}, 0, "Nil"},
  {"an open length, the max stays",          FROM_LENGTH(Single), {"{a,Max}", "Any"}, 0, "{a,Max}"},
};
// clang-format on

TEST(EnumExamples, EachInItsForms) {
  for (const Example& example : kExamples) example.check(example);
}

}  // namespace
}  // namespace zor::test
