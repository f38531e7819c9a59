// Sequences of operations on a few values: which, and on what, the input says. After each of them every value must be
// well formed and its own, what the operation answered must be true of its target, nothing else may have changed, and
// operands that coincide must count as what they were before.
//
// With ZOR_TRACE in the environment each operation is told, with what it answered and left.
#include "module/operations.h"
#include "fuzz/operands.h"

namespace {

using namespace zor::fuzz;
using Shape = zor::Operation::Shape;

// What an operation may do that others must not.
enum Licence : unsigned {
  kStrict = 0,       // 0: the target is as it was, 1: it is not
  kRepeats = 1,      // answers 1 whatever was there before
  kSetRepeats = 2,   // the same where *this is a set
  kTellsOther = 4,   // the answer is about something else
  kAddsEquals = 8,   // takes equal texts as they come
  kAddsToOpen = 16,  // adds texts to an Any or Nil set, which stays that
};

// A row: the licence, the name and the operands, *this first. Their classes tell a typed form from the entry of the
// solver's table, and the first value that is not const is the target. DO is for bodies that are more than a call.
#define CALL(licence, Name, ...) \
  Make<__VA_ARGS__>(#Name "(" #__VA_ARGS__ ")", licence, [](auto& v, auto&&... x) { return v.Name(x...); })
#define DO(licence, name, body, ...) Make<__VA_ARGS__>(name, licence, body)

// Whether an operation may answer 1 for a target that stays as it was. A set takes a single value as its only text,
// and replaces what the extremes and lengths narrow.
constexpr unsigned LicenceOf(std::string_view name, Shape shape) {
  if (shape == Shape::Form) return kRepeats | kAddsEquals;
  if (shape == Shape::Length) return kSetRepeats;
  if (shape == Shape::Alone) return kStrict;
  for (const std::string_view repeating :
       {"CalcEqualValue", "CalcMinValue", "CalcMaxValue", "CalcNextValue", "CalcInverseNextValue"})
    if (name == repeating) return kSetRepeats;
  return kStrict;
}
constexpr unsigned LicenceOfTyped(std::string_view name, Shape shape) {
  return name == "Assign" ? kRepeats : name == "CalcEqualValue" ? kStrict : LicenceOf(name, shape);
}

// An operand as a form takes it: that of a text form must be there, and a typed form takes values of its own class.
template <bool kGiven, class Operand>
using Taken = std::conditional_t<kGiven, Given<std::remove_reference_t<Operand>>, Operand>;
template <class Value, class Operand, bool kConst = std::is_const_v<std::remove_reference_t<Operand>>>
using Typed = std::conditional_t<!std::is_base_of_v<std::remove_cvref_t<Operand>, Value>, Operand,
                                 std::conditional_t<kConst, const Value&, Value&>>;

template <Shape kShape, class Self, class... Operands, class Body>
constexpr Operation MakeEntry(const char* name, unsigned licence, Body body) {
  return Make<Self, Taken<kShape == Shape::Form, Operands>...>(name, licence, body);
}

template <class Value, class... Operands, class Body>
constexpr Operation MakeTyped(const char* name, unsigned licence, Body body) {
  return Make<Typed<Value, Operands>...>(name, licence, body);
}

#define ENTRY(shape, Name, ...)                                                                    \
  MakeEntry<Shape::shape, __VA_ARGS__>(#Name "(" #__VA_ARGS__ ")", LicenceOf(#Name, Shape::shape), \
                                       [](auto& v, auto&&... x) { return v.Name(x...); }),
#define TYPED(shape, Name, ...)                                                      \
  MakeTyped<Value, __VA_ARGS__>("typed " #Name, LicenceOfTyped(#Name, Shape::shape), \
                                [](auto& v, auto&&... x) { return v.Name(x...); }),

// The entries of the solver's table: those that all values have are called on all, the rest on strings.
constexpr Operation kEntries[] = {
    // clang-format off
    DO(kAddsEquals, "InputValue", [](Any& v, Text x) { ZORistrstream in(x.CastToCharPtr(), 0); v.InputValue(in); }, Any&, const Text&),
    DO(kAddsEquals, "InputValue of a form", [](Any& v, const Any& x) { const std::string form = Form(x); ZORistrstream in(form.c_str(), 0); v.InputValue(in); }, Any&, Given<const Any>),
    DO(kAddsEquals, "Read", [](Any& v, const Any& x) { ZORopstream out; x.Write(out); ZORipstream in(out.Bytes()); v.Read(in); }, Any&, Given<const Any>),
    DO(kStrict, "SetExactValue", [](Integer& v, int x) { v.SetExactValue(x); }, Integer&, int),
    DO(kStrict, "fill", [](Set& v, int x) { v.SetNilValue(); for (int i = 0; i < x * 3; ++i) v.InsertExactValue(std::to_string(i).c_str()); }, Set&, int),
    CALL(kStrict, SetNilValue, Any&), CALL(kStrict, SetUndefinedValue, Any&),
    CALL(kStrict, IsNil, const Any&), CALL(kStrict, IsUndefined, const Any&),
    CALL(kStrict, IsEmpty, const String&), CALL(kStrict, IsFull, const String&),
    CALL(kStrict, GetCardinality, const Any&), CALL(kStrict, GetWidth, const Any&), CALL(kStrict, GetRelativeWidth, const Any&, int),
    CALL(kStrict, GetDescriptor, const Any&), CALL(kStrict, CastableID, const Any&),
    CALL(kStrict, GetLowerBound, const String&), CALL(kStrict, GetUpperBound, const String&),
    CALL(kStrict, GetNextExactValue, const String&, const Text&), CALL(kStrict, GetPrevExactValue, const String&, const Text&),
    CALL(kStrict, SetExactValue, String&, const Text&), CALL(kStrict, InsertExactValue, String&, const Text&), CALL(kStrict, RemoveExactValue, String&, const Text&),

    DO(kStrict, "Bisect", [](String& v, Any& x, int selection) { v.Bisect(x, static_cast<Any::ValueSelection>(selection % 6)); }, String&, Any&, int),
    ZOR_STRING_OPERATIONS(ENTRY)
    // clang-format on
};

// Where a descriptor makes a value, and destroys it.
template <class Value>
class Place {
 public:
  ~Place() { Value::sDescriptor->DestroyObject(mValue); }

  template <class... Text>
  const Value* Create(const Text*... text) {
    if (Value::sDescriptor->GetObjectSize() != sizeof(Value)) Fail("a value of another size");
    mValue = static_cast<Value*>(Value::sDescriptor->CreateObject(mMemory, text...));
    return mValue;
  }

 private:
  alignas(Value) unsigned char mMemory[sizeof(Value)];
  Value* mValue = nullptr;
};

// The forms that both classes have on values of their own.
template <class Value>
constexpr Operation kForms[] = {
    // clang-format off
    DO(kStrict, "from a text", [](Value& v, const Text& x) { v = Value(x); }, Value&, const Text&),
    DO(kStrict, "from its descriptor", [](Value& v) { Place<Value> made; v = *made.Create(); }, Value&),
    DO(kStrict, "from its descriptor and characters", [](Value& v, Text x) { Place<Value> made; v = *made.Create(x.CastToCharPtr()); }, Value&, const Text&),
    DO(kStrict, "copy", [](Value& v, const Value& x) { Value copy(x); v = copy; }, Value&, const Value&),
    DO(kStrict, "from characters", [](Value& v, Text x) { v = Value(static_cast<const void*>(x.CastToCharPtr())); }, Value&, const Text&),
    DO(kStrict, "operator=", [](Value& v, const Value& x) { v = x; }, Value&, const Value&),
    CALL(kTellsOther, Copy, Value&, const Value&), CALL(kStrict, Nil, Value&), CALL(kStrict, Any, Value&),
    CALL(kStrict, SetLowerBound, Value&, const Text&), CALL(kStrict, SetUpperBound, Value&, const Text&),
    ZOR_STRING_OPERATIONS(TYPED)
    // clang-format on
};

// The forms of one class alone.
constexpr Operation kOwnForms[] = {
    // clang-format off
    CALL(kRepeats, Copy, Single&, const Text&),
    DO(kStrict, "operator= of characters", [](Single& v, Text x) { v = x.CastToCharPtr(); }, Single&, const Text&),

    DO(kStrict, "from a single value", [](Set& v, const Single& x) { v = Set(x); }, Set&, const Single&),
    CALL(kRepeats, Assign, Set&, const Single&), CALL(kRepeats, Copy, Set&, const Single&),
    CALL(kStrict, Contains, const Set&, const Text&), DO(kStrict, "Contains of a pointer", [](const Set& v, const Text& x) { v.Contains(&x); }, const Set&, const Text&),
    CALL(kStrict, Count, const Set&),
    CALL(kAddsToOpen, Insert, Set&, const Text&), CALL(kTellsOther | kAddsToOpen, Append, Set&, const Set&), CALL(kTellsOther | kAddsToOpen, Append, Set&, const Vector&),
    CALL(kTellsOther, CutLower, Set&, const Text&), CALL(kTellsOther, CutUpper, Set&, const Text&),
    CALL(kStrict | kAddsEquals, Intersect, Set&, const Vector&), CALL(kRepeats, Intersect, Set&, const Single&), CALL(kStrict, IntersectInverse, const Set&, Single&),
    CALL(kRepeats, CalcEqualValue, Set&, const Single&), CALL(kStrict, CalcInverseEqualValue, const Set&, Single&),
    CALL(kStrict, Unite, Set&, const Single&),
    CALL(kStrict, CalcLessOrEqualValue, Set&, const Single&), CALL(kStrict, CalcInverseLessOrEqualValue, const Set&, Single&),
    CALL(kStrict, CalcInverseNotLessValue, const Set&, Single&), CALL(kStrict, CalcInverseNotLessAndUnequalValue, const Set&, Single&),
    CALL(kStrict, CalcLowerValue, Set&, const Single&), CALL(kStrict, CalcInverseLowerValue, const Set&, Single&),
    CALL(kStrict, CalcUpperValue, Set&, const Single&), CALL(kStrict, CalcInverseUpperValue, const Set&, Single&),
    // clang-format on
};

const std::vector<Operation>& Operations() {
  static const std::vector<Operation> kAll = [] {
    std::vector<Operation> all(std::begin(kEntries), std::end(kEntries));
    all.insert(all.end(), std::begin(kForms<Single>), std::end(kForms<Single>));
    all.insert(all.end(), std::begin(kForms<Set>), std::end(kForms<Set>));
    all.insert(all.end(), std::begin(kOwnForms), std::end(kOwnForms));
    return all;
  }();
  return kAll;
}

// Whether a value has still that content, in the very same objects.
bool IsStill(const Content& content, const Any& value) {
  if (const auto* const single = Single::DynamicCast(&value); single != nullptr)
    return single->GetState() == content.state && content.texts[0] == View(single->GetLowerBound());
  const auto* const set = Set::DynamicCast(&value);
  if (set == nullptr) return ContentOf(value) == content;
  const auto count = static_cast<std::size_t>(set->Count());
  if (set->GetState() != content.state || count != content.texts.size()) return false;
  for (std::size_t i = 0; i < count; ++i) {
    const Text& text = set->GetValue(static_cast<int>(i));
    if (&text != content.objects[i] || content.texts[i] != View(text)) return false;
  }
  return true;
}

class Sequence {
 public:
  void Step(Bytes& bytes);

 private:
  void CloseOpenSet(const Operation& operation);
  std::string FaultOf(const Operation& operation);
  std::string FaultOfTwins() const;
  std::string FaultOfAnswer(const Operation& operation, std::size_t target) const;
  bool HasChanged(std::size_t i) const { return std::find(mChanged.begin(), mChanged.end(), i) != mChanged.end(); }
  bool Shares() const;
  void Shrink(std::size_t i);
  std::string Tell(const Operation& operation) const;

  Network mNetwork;
  std::array<Network, kMostOperands> mTwins;
  Network::Contents mIs = mNetwork.Now(), mWas;  // what was is kept of the values that the last operation changed
  std::vector<std::size_t> mChanged;
  Call mCall{};
  bool mMayHaveEquals = false;  // once equal texts have been let in, copies may have them too
};

void Sequence::Step(Bytes& bytes) {
  static const bool kTrace = std::getenv("ZOR_TRACE") != nullptr;
  const Operation& operation = Operations()[bytes.Below(Operations().size())];
  Choices choices{mNetwork, mTwins, bytes};
  mCall = operation.act(choices);
  std::string fault = FaultOfTwins();
  CloseOpenSet(operation);
  mChanged.clear();
  for (std::size_t i = 0; i < kValues; ++i) {
    if (IsStill(mIs[i], mNetwork[i])) continue;
    mWas[i] = std::exchange(mIs[i], ContentOf(mNetwork[i]));
    mChanged.push_back(i);
  }
  if (kTrace) std::fprintf(stderr, "%s\n", Tell(operation).c_str());
  if (fault.empty()) fault = FaultOf(operation);
  if (!fault.empty()) Fail(fault + "\n" + Tell(operation));
  for (const std::size_t i : mChanged) Shrink(i);
}

// Texts in a set that says nothing or everything about them have no meaning for other operations.
void Sequence::CloseOpenSet(const Operation& operation) {
  if ((operation.licence & kAddsToOpen) == 0) return;
  Any& set = mNetwork[mNetwork.Find(mCall.target)];
  if (set.IsNil() == 0 && set.IsUndefined() == 0) return;
  set.SetNilValue();
  mCall.answer = kNoAnswer;
}

std::string Sequence::FaultOfTwins() const {
  if (!mCall.isTwice) return "";
  const Content twin = mCall.twin != nullptr ? ContentOf(*mCall.twin) : Content();
  const bool isAlike = mCall.twin == nullptr || ContentOf(*mCall.target) == twin;
  if (isAlike && mCall.answer == mCall.twinAnswer) return "";
  return "operands of their own make it " + std::to_string(mCall.twinAnswer) + " and " + twin.Show();
}

std::string Sequence::FaultOf(const Operation& operation) {
  if (!mCall.hasKept) return "an operand of the caller's has changed";
  const std::size_t target = mNetwork.Find(mCall.target);
  for (const std::size_t i : mChanged) {
    if (const std::string fault = Fault(mNetwork[i], mIs[i]); !fault.empty()) return fault;
    if (i != target) return "changed, and was no target";
    const auto& texts = mIs[i].texts;
    const bool hasEquals = std::adjacent_find(texts.begin(), texts.end()) != texts.end();
    if (hasEquals && (operation.licence & kAddsEquals) != 0) mMayHaveEquals = true;
    if (hasEquals && !mMayHaveEquals) return "a text twice in a set";
  }
  if (Shares()) return "two values share a text";
  return target == kValues ? "" : FaultOfAnswer(operation, target);
}

std::string Sequence::FaultOfAnswer(const Operation& operation, std::size_t target) const {
  if (mCall.answer == kNoAnswer || (operation.licence & kTellsOther) != 0) return "";
  if (mCall.answer != 0 && mCall.answer != 1) return "an answer that is neither 0 nor 1";
  if (mCall.answer == 0) return HasChanged(target) ? "changed, and answered 0" : "";
  const unsigned repeats = Set::DynamicCast(mCall.self) != nullptr ? kRepeats | kSetRepeats : kRepeats;
  if ((operation.licence & repeats) != 0) return "";
  return HasChanged(target) && !(mIs[target] == mWas[target]) ? "" : "as it was, and answered 1";
}

bool Sequence::Shares() const {
  if (mChanged.empty()) return false;
  std::vector<const ZORString*> all;
  for (const Content& content : mIs) all.insert(all.end(), content.objects.begin(), content.objects.end());
  std::sort(all.begin(), all.end());
  return std::adjacent_find(all.begin(), all.end()) != all.end();
}

// Concatenations of concatenations, or long lists of numbers, would soon be all that there is time for.
void Sequence::Shrink(std::size_t i) {
  constexpr std::size_t kMostTexts = 600, kMostCharacters = 20000, kMostOfNumbers = 500;
  std::size_t characters = 0;
  for (const std::string& text : mIs[i].texts) characters += text.size();
  if (mIs[i].texts.size() <= kMostTexts && characters <= (i < kIntegers ? kMostCharacters : kMostOfNumbers)) return;
  mNetwork[i].SetUndefinedValue();
  mIs[i] = ContentOf(mNetwork[i]);
}

std::string Sequence::Tell(const Operation& operation) const {
  std::string told = operation.name + (" on " + std::to_string(mNetwork.Find(mCall.self)));
  if (mCall.answer != kNoAnswer) told += " answers " + std::to_string(mCall.answer);
  for (const std::size_t i : mChanged)
    told += "\n  " + std::to_string(i) + " was " + mWas[i].Show() + "\n    is  " + mIs[i].Show();
  return told;
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const ModuleInUse kModule;
  constexpr int kMostSteps = 200;
  Bytes bytes(data, size);
  Sequence sequence;
  for (int i = 0; i < kMostSteps && !bytes.Ended(); ++i) sequence.Step(bytes);
  return 0;
}
