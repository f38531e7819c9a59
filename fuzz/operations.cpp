// Sequences of operations on a few values, beside their models: which, and on what, the input says. Operands may be one
// object, and texts those that a set lists.
#include "fuzz/support.h"
#include "tests/enum/rows.h"
#include "tests/single/rows.h"

namespace {

using namespace zor::test;

const std::vector<Row>& Rows() {
  static const std::vector<Row> kRows = [] {
    std::vector<Row> rows = SingleRows();
    rows.insert(rows.end(), SetRows().begin(), SetRows().end());
    return rows;
  }();
  return kRows;
}

constexpr std::size_t kOfAKind = 3;  // objects

class Sequence {
 public:
  void Step(zor::fuzz::Bytes& bytes) {
    const Row& row = Rows()[bytes.Below(Rows().size())];
    std::array<Object*, kMostOperands> objects{};
    std::array<Value*, kMostOperands> expected{};
    for (std::size_t i = 0; i < row.kinds.size(); ++i) {
      const std::size_t at = row.kinds[i] * kOfAKind + bytes.Below(kOfAKind);
      if (row.kinds[i] >= kFirstGiven) Give(at, bytes, *objects[0]);
      objects[i] = &mObjects[at];
      expected[i] = &mExpected[at];
    }
    if (AssignsEquals(row, expected)) return;
    std::string fault = Call(row, objects.data(), expected.data());
    if (mObjects.ShareTexts()) fault += "two values share a text";
    if (!fault.empty()) zor::fuzz::Fail(std::string(row.name) + ": " + fault);
    for (std::size_t i = 0; i < kFirstGiven * kOfAKind; ++i) Shrink(i);
  }

 private:
  static constexpr std::size_t kFirstGiven = 2;  // integers and words are chosen anew each time

  static std::vector<Value> Fresh() {
    std::vector<Value> values(kOfAKind, Str());
    values.insert(values.end(), kOfAKind, Set());
    values.insert(values.end(), kOfAKind, Int());
    values.insert(values.end(), kOfAKind, Word());
    return values;
  }

  void Give(std::size_t at, zor::fuzz::Bytes& bytes, Object& self) {
    const unsigned choice = bytes.Next();
    if (at < 3 * kOfAKind) {
      mExpected[at] = choice == 0 ? Int(kNilTag) : choice == 1 ? Int() : Int(static_cast<signed char>(choice) * 3);
    } else {
      mExpected[at] = Word{PickText(choice, bytes)};
    }
    mObjects.Replace(at, mExpected[at]);
    auto* const set = std::get_if<HeldSet>(&self);
    if (at < 3 * kOfAKind || set == nullptr || set->value.Count() == 0 || choice % 4 != 0) return;
    auto& word = std::get<HeldWord>(mObjects[at]);
    word.listed = &set->value.GetValue(static_cast<int>(choice / 4 % static_cast<unsigned>(set->value.Count())));
    word.own = *word.listed;
    mExpected[at] = word.Now();
  }

  static std::string PickText(unsigned choice, zor::fuzz::Bytes& bytes) {
    static const char* const kTexts[] = {"",      " ",     "  ",    "a",     "b",     "ab",     "aB",
                                         "A",     "B",     "z",     "{",     "~",     "\"",     "\xff",
                                         "a ",    "ab ",   "ac",    "Max",   "Nil",   "z*31",   "a*32",
                                         "a*254", "a*255", "z*255", "z*256", "A*300", "z*254y", "a*253zz"};
    constexpr unsigned kOwn = 192;  // from here on the text stands in the input
    return choice < kOwn ? Unpacked(kTexts[choice % std::size(kTexts)]) : bytes.Take(choice - kOwn);
  }

  // To itself a value is assigned without going through a list.
  static bool AssignsEquals(const Row& row, const std::array<Value*, kMostOperands>& expected) {
    const Set* const set = std::get_if<Set>(expected[0]);
    return row.Is("Assign", "Copy") && set != nullptr && expected[0] == expected[1] && set->HasEquals();
  }

  // Concatenations of concatenations would soon be all that there is time for. Texts in a set that says nothing, or is
  // a contradiction, have no meaning for other operations.
  void Shrink(std::size_t i) {
    constexpr std::size_t kMostTexts = 600, kMostCharacters = 20000;
    const Set* const set = std::get_if<Set>(&mExpected[i]);
    if (set == nullptr || set->texts.empty()) return;
    std::size_t characters = 0;
    for (const std::string& text : set->texts) characters += text.size();
    const bool open = set->tag == kAnyTag || set->tag == kNilTag;
    if (!open && set->texts.size() <= kMostTexts && characters <= kMostCharacters) return;
    mExpected[i] = Set();
    mObjects.Replace(i, mExpected[i]);
  }

  std::vector<Value> mExpected = Fresh();
  Objects mObjects{mExpected};
};

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const zor::fuzz::ModuleInUse kModule;
  zor::fuzz::Bytes bytes(data, size);
  Sequence sequence;
  for (int steps = 0; steps < 200 && !bytes.Ended(); ++steps) sequence.Step(bytes);
  return 0;
}
