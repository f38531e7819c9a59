#include "network/shapes.h"

#include <algorithm>

#include "network/expression.h"

namespace zornet {

namespace {

constexpr int kLimit = static_cast<int>(kTextLimit);

int Clamped(std::int64_t length) { return static_cast<int>(std::clamp<std::int64_t>(length, -1, kLimit)); }

Shape OfLength(std::int64_t shortest, std::int64_t longest) {
  Shape shape;
  shape.shortest = static_cast<int>(std::clamp<std::int64_t>(shortest, 0, kLimit + 1));
  shape.longest = Clamped(longest);
  return shape;
}

// The first characters of a text, and the last.
ZORString Head(const ZORString& text, std::int64_t length) {
  return ZORString(text.View().substr(0, static_cast<std::size_t>(std::max<std::int64_t>(length, 0))));
}
ZORString Tail(const ZORString& text, std::int64_t length) {
  const auto size = static_cast<std::int64_t>(text.View().size());
  return ZORString(text.View().substr(static_cast<std::size_t>(size - std::clamp<std::int64_t>(length, 0, size))));
}
// What stands from a position on, at most so many characters.
ZORString Middle(const ZORString& text, std::int64_t from, std::int64_t length) {
  const auto size = static_cast<std::int64_t>(text.View().size());
  if (from < 0 || from >= size || length <= 0) return {};
  return ZORString(text.View().substr(static_cast<std::size_t>(from), static_cast<std::size_t>(length)));
}

bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }

ZORString Folded(Meaning meaning, ZORString text) {
  meaning == Meaning::Lower ? text.ToLower() : text.ToUpper();
  return text;
}

// Characters whose fold is one of the folds.
Characters FoldedInto(Meaning meaning, const Characters& folds) {
  Characters characters;
  for (std::size_t bit = 0; bit < characters.size(); ++bit) {
    const char c = CharacterAt(bit);
    characters[bit] = folds[BitOf(Folded(meaning, ZORString(&c, 1)).View()[0])];
  }
  return characters;
}

Characters FoldsOf(Meaning meaning, const Characters& characters) {
  Characters folds;
  for (std::size_t bit = 0; bit < characters.size(); ++bit) {
    const char c = CharacterAt(bit);
    if (characters[bit]) folds.set(BitOf(Folded(meaning, ZORString(&c, 1)).View()[0]));
  }
  return folds;
}

}  // namespace

bool Shapes::Narrow(const Constraint& constraint) {
  const auto arguments = constraint.arguments;
  if (std::none_of(arguments.begin(), arguments.end(), [this](int v) { return IsUnlisted(v); })) return false;
  const std::size_t touched = mStore.Touched().size();
  mStore.StartOperation(Operation::Shape);
  constraint.kind->reified ? ApplyReified(constraint) : Apply(constraint);
  return mStore.Touched().size() != touched;
}

void Shapes::Meet(int variable, const Shape& shape) {
  if (!mStore.HasFailed()) mStore.MeetShape(variable, shape);
}

// The truth is the last argument. While it is open nothing is told but that two texts cannot be equal.
void Shapes::ApplyReified(const Constraint& constraint) {
  const Value& truth = mStore[constraint.Result()];
  if (truth.IsOne()) return Relate(constraint, truth.LowestNumber() != 0);
  if (constraint.kind->meaning != Meaning::Equal) return;
  Shape both = mStore.ShapeOf(constraint.arguments[0]);
  both.Meet(mStore.ShapeOf(constraint.arguments[1]));
  if (!both.IsNothing()) return;
  Value& answer = mStore.FreshLike(constraint.Result());
  answer.SetNumber(0);
  mStore.Meet(constraint.Result(), answer);
}

void Shapes::Apply(const Constraint& constraint) {
  const auto arguments = constraint.arguments;
  const auto inputs = arguments.first(constraint.Inputs());
  const int x = arguments[0], z = arguments.back();
  switch (constraint.kind->meaning) {
    case Meaning::Concatenation:
      return Concatenation(inputs, z);
    case Meaning::Slice:
      return Slice(constraint);
    case Meaning::Length:
      return Length(x, z);
    case Meaning::Lower:
    case Meaning::Upper:
      return Case(constraint.kind->meaning, x, z);
    case Meaning::Minimum:
    case Meaning::Maximum:
      return Extreme(constraint.kind->meaning, inputs, z);
    case Meaning::Successor:
      return Successor(x, z);
    case Meaning::TextForm:
      return TextForm(x, z);
    default:
      return Relate(constraint, true);
  }
}

void Shapes::Relate(const Constraint& constraint, bool holds) {
  const int x = constraint.arguments[constraint.kind->mirrored ? 1 : 0];
  const int y = constraint.arguments[constraint.kind->mirrored || constraint.arguments.size() < 2 ? 0 : 1];
  const Meaning meaning = constraint.kind->meaning;
  const bool isOrder = meaning == Meaning::Less || meaning == Meaning::LessOrEqual;
  if (isOrder) return holds ? Order(x, y, meaning == Meaning::Less) : Order(y, x, meaning == Meaning::LessOrEqual);
  if (meaning == (holds ? Meaning::Equal : Meaning::Unequal)) return Equal(x, y);
  if (!holds) return;
  if (meaning == Meaning::Prefix) return Prefix(x, y);
  if (meaning == Meaning::Suffix) return Suffix(x, y);
  if (meaning == Meaning::Contains) return Part(y, x);
  if (meaning == Meaning::Matches) return Matches(x, *constraint.expression);
  if (meaning == Meaning::Position) return Position(x, y, constraint.arguments[2]);
}

void Shapes::Equal(int x, int y) {
  Meet(x, mStore.ShapeOf(y));
  if (!mStore.HasFailed()) Meet(y, mStore.ShapeOf(x));
}

void Shapes::Order(int x, int y, bool strict) {
  Shape below;
  below.greatest = PlainOf(y).Highest();
  Meet(x, below);
  if (mStore.HasFailed()) return;
  Shape above = strict ? OfLength(1, kLimit) : Shape();
  above.least = PlainOf(x).Lowest();
  Meet(y, above);
}

// The part stands somewhere in the whole.
void Shapes::Part(int part, int whole) {
  Shape inner = OfLength(0, PlainOf(whole).longest);
  inner.characters = PlainOf(whole).characters;
  Meet(part, inner);
  if (!mStore.HasFailed()) Meet(whole, OfLength(PlainOf(part).shortest, kLimit));
}

void Shapes::Prefix(int x, int y) {
  Part(x, y);
  if (mStore.HasFailed()) return;
  Shape whole, part;
  whole.beginning = PlainOf(x).beginning;
  whole.shortest = whole.beginning.GetLengthInChar();
  Meet(y, whole);
  if (mStore.HasFailed()) return;
  part.beginning = Head(PlainOf(y).beginning, PlainOf(x).shortest);
  Meet(x, part);
}

void Shapes::Suffix(int x, int y) {
  Part(x, y);
  if (mStore.HasFailed()) return;
  Shape whole, part;
  whole.end = PlainOf(x).end;
  Meet(y, whole);
  if (mStore.HasFailed()) return;
  part.end = Tail(PlainOf(y).end, PlainOf(x).shortest);
  Meet(x, part);
}

void Shapes::Matches(int x, const Expression& expression) { Meet(x, expression.Forced()); }

// The texts of the parts one after another, all of them if they are not too long, or the greatest text.
void Shapes::Concatenation(std::span<const int> inputs, int result) {
  mParts.clear();
  for (const int input : inputs) mParts.push_back(mStore.ShapeOf(input));
  const Shape joined = Shape::Concatenation(mParts);
  if (joined.shortest > kLimit) return Meet(result, Shape(GreatestText()));
  Concatenated(inputs, joined, result);
}

// A result that cannot be the greatest text, or parts that cannot be too long, tell the parts what the others leave.
void Shapes::Concatenated(std::span<const int> inputs, const Shape& joined, int result) {
  const bool overflows = joined.longest > kLimit || joined.orGreatest;
  Shape bounded = joined;
  bounded.longest = std::min(joined.longest, kLimit);
  bounded.orGreatest = overflows;
  Meet(result, bounded);
  if (mStore.HasFailed()) return;
  const Shape whole = mStore.ShapeOf(result);
  if (overflows && whole.Admits(GreatestText().View())) return;
  std::int64_t before = 0, after = 0;  // characters before a part and behind it, while they are sure; else -1
  for (std::size_t i = 0; i < inputs.size(); ++i) {
    after = 0;
    for (std::size_t j = i + 1; j < inputs.size(); ++j)
      after = after < 0 || mParts[j].shortest != mParts[j].longest ? -1 : after + mParts[j].shortest;
    const Shape& part = mParts[i];
    Shape left =
        OfLength(whole.shortest - (joined.longest - part.longest), whole.longest - (joined.shortest - part.shortest));
    const int length = std::max(left.shortest, part.shortest);
    left.characters = whole.characters;
    if (before >= 0) left.beginning = Middle(whole.beginning, before, length);
    const std::int64_t known = whole.end.GetLengthInChar() - after;  // of the end, up to the part's own
    if (after >= 0) left.end = Tail(Head(whole.end, known), length);
    if (i == 0) left.greatest = whole.greatest;
    Meet(inputs[i], left);
    before = before < 0 || part.shortest != part.longest ? -1 : before + part.shortest;
  }
}

void Shapes::Slice(const Constraint& constraint) {
  const int x = constraint.arguments[0], z = constraint.Result();
  const std::int64_t from = std::max<std::int64_t>(mStore.LowestNumber(constraint.arguments[1]), 0);
  const std::int64_t lastFrom = mStore.HighestNumber(constraint.arguments[1]);
  const std::int64_t firstTo = mStore.LowestNumber(constraint.arguments[2]);
  const std::int64_t to = mStore.HighestNumber(constraint.arguments[2]);
  const Shape whole = PlainOf(x);
  Shape slice = OfLength(0, std::max<std::int64_t>(std::min<std::int64_t>(whole.longest - from, to - from + 1), 0));
  slice.characters = whole.characters;
  const bool inside = mStore.LowestNumber(constraint.arguments[1]) >= 0;
  if (inside)
    slice.shortest = OfLength(std::min<std::int64_t>(whole.shortest - lastFrom, firstTo - lastFrom + 1), 0).shortest;
  if (inside && from == lastFrom) slice.beginning = Middle(whole.beginning, from, slice.shortest);
  if (firstTo >= whole.longest - 1) slice.end = Tail(whole.end, slice.shortest);
  Meet(z, slice);
  if (mStore.HasFailed()) return;
  const Shape left = PlainOf(z);
  if (left.shortest == 0) return;
  Shape given = OfLength(from + left.shortest, kLimit);
  if (from == lastFrom && from == 0) given.beginning = left.beginning;
  if (firstTo >= whole.longest - 1) given.end = left.end;
  Meet(x, given);
}

void Shapes::Length(int x, int number) {
  Meet(x, OfLength(mStore.LowestNumber(number), mStore.HighestNumber(number)));
  if (mStore.HasFailed()) return;
  const Shape shape = PlainOf(x);
  mStore.Bound(number, shape.shortest, shape.longest);
}

// What is folded keeps its length and place; a letter has two originals, any other character is its own.
void Shapes::Case(Meaning meaning, int x, int z) {
  const Shape original = PlainOf(x);
  Shape fold = OfLength(original.shortest, original.longest);
  fold.characters = FoldsOf(meaning, original.characters);
  fold.beginning = Folded(meaning, original.beginning);
  fold.end = Folded(meaning, original.end);
  Meet(z, fold);
  if (mStore.HasFailed()) return;
  const Shape left = PlainOf(z);
  Shape given = OfLength(left.shortest, left.longest);
  given.characters = FoldedInto(meaning, left.characters);
  const std::string_view head = left.beginning.View(), tail = left.end.View();
  given.beginning = Head(left.beginning, std::find_if(head.begin(), head.end(), IsLetter) - head.begin());
  given.end = Tail(left.end, std::find_if(tail.rbegin(), tail.rend(), IsLetter) - tail.rbegin());
  Meet(x, given);
}

// The result is one of the inputs, and none of them is beyond it.
void Shapes::Extreme(Meaning meaning, std::span<const int> inputs, int result) {
  const bool isLeast = meaning == Meaning::Minimum;
  Shape any = PlainOf(inputs.front());
  ZORString bound = isLeast ? any.Highest() : any.Lowest();
  for (const int input : inputs.subspan(1)) {
    const Shape shape = PlainOf(input);
    any.Include(shape);
    bound = isLeast ? std::min(bound, shape.Highest()) : std::max(bound, shape.Lowest());
  }
  (isLeast ? any.greatest : any.least) = bound;
  Meet(result, any);
  for (const int input : inputs) {
    if (mStore.HasFailed()) return;
    Shape beyond;
    (isLeast ? beyond.least : beyond.greatest) = isLeast ? PlainOf(result).Lowest() : PlainOf(result).Highest();
    Meet(input, beyond);
  }
}

// One space more, unless there is no room for it.
void Shapes::Successor(int x, int z) {
  Meet(z, OfLength(1, kLimit));
  if (mStore.HasFailed() || x == z) return;
  const Shape text = PlainOf(x);
  if (text.longest == kLimit) return;
  Shape next = OfLength(text.shortest + 1, text.longest + 1);
  next.beginning =
      text.IsWhole() && text.shortest == text.longest ? ZORString::Concatenation(text.beginning, " ") : text.beginning;
  next.end = ZORString::Concatenation(text.end, " ");
  next.characters = text.characters;
  next.characters.set(BitOf(' '));
  Meet(z, next);
  if (mStore.HasFailed()) return;
  const Shape left = PlainOf(z);
  Shape given = OfLength(left.shortest - 1, left.longest - 1);
  given.characters = left.characters;
  given.beginning = Head(left.beginning, left.shortest - 1);
  given.end = Head(left.end, left.end.GetLengthInChar() - 1);
  Meet(x, given);
}

// Found: it stands there; else the number is -1.
void Shapes::Position(int x, int y, int number) {
  if (mStore.LowestNumber(number) >= 0) Part(y, x);
  if (mStore.HasFailed()) return;
  const std::int64_t first = mStore.LowestNumber(number);
  mStore.Bound(number, -1, std::max<std::int64_t>(PlainOf(x).longest - PlainOf(y).shortest, -1));
  if (mStore.HasFailed() || first < 0) return;
  Meet(x, OfLength(first + PlainOf(y).shortest, kLimit));
  if (!mStore.HasFailed()) Meet(y, OfLength(0, PlainOf(x).longest - first));
}

void Shapes::TextForm(int value, int z) {
  const Sort sort = mStore[value].Sort();
  if (IsText(sort)) return Meet(z, OfLength(2, kLimit));
  if (sort == Sort::Boolean) return;
  Shape form = OfLength(1, 11);
  form.characters = CharactersOf("-0123456789");
  Meet(z, form);
}

}  // namespace zornet
