#include "network/shape.h"

#include <algorithm>
#include <utility>

namespace zornet {

namespace {

std::string_view CommonBeginning(std::string_view a, std::string_view b) {
  const auto end = std::mismatch(a.begin(), a.end(), b.begin(), b.end()).first;
  return a.substr(0, static_cast<std::size_t>(end - a.begin()));
}

std::string_view CommonEnd(std::string_view a, std::string_view b) {
  const auto end = std::mismatch(a.rbegin(), a.rend(), b.rbegin(), b.rend()).first;
  const auto length = static_cast<std::size_t>(end - a.rbegin());
  return a.substr(a.size() - length);
}

int LengthOf(const ZORString& text) { return text.GetLengthInChar(); }

// Nothing is copied when the text is the old one.
void Shorten(ZORString& text, std::string_view common) {
  if (common.size() != text.View().size()) text = ZORString(common);
}

}  // namespace

Characters CharactersOf(std::string_view text) {
  Characters characters;
  for (const char c : text) {
    if (BitOf(c) < characters.size()) characters.set(BitOf(c));
  }
  return characters;
}

Shape::Shape(const ZORString& text) { Become(text); }

Shape::Shape(std::span<const ZORString> texts) {
  Become(texts.front());
  for (const ZORString& text : texts.subspan(1)) {
    const std::string_view view = text.View();
    shortest = std::min(shortest, LengthOf(text));
    longest = std::max(longest, LengthOf(text));
    Shorten(beginning, CommonBeginning(beginning.View(), view));
    Shorten(end, CommonEnd(end.View(), view));
    if (text < least) least = text;
    if (greatest < text) greatest = text;
    characters |= CharactersOf(view);
  }
}

Shape Shape::Concatenation(std::span<const Shape> parts) {
  Shape joined;
  joined.longest = 0;
  joined.characters.reset();
  bool isWhole = true;  // all before the part
  for (const Shape& part : parts) {
    joined.shortest += part.shortest;
    joined.longest += part.longest;
    joined.characters |= part.characters;
    joined.orGreatest = joined.orGreatest || part.orGreatest;
    if (isWhole) joined.beginning.Append(part.beginning);
    isWhole = isWhole && part.IsWhole() && !part.orGreatest;
  }
  for (auto part = parts.rbegin(); part != parts.rend(); ++part) {
    joined.end = ZORString::Concatenation(part->end, joined.end);
    if (!part->IsWhole() || part->orGreatest) break;
  }
  if (!parts.empty()) joined.least = std::max(parts.front().Lowest(), joined.beginning);
  return joined;
}

void Shape::Become(const ZORString& text) {
  shortest = longest = LengthOf(text);
  beginning = end = least = greatest = text;
  characters = CharactersOf(text.View());
  orGreatest = false;
}

void Shape::BecomeNothing() {
  if (orGreatest) return Become(GreatestText());
  *this = Shape();
  shortest = longest + 1;
}

bool Shape::Admits(std::string_view text) const {
  if (orGreatest && text == GreatestText().View()) return true;
  const auto length = static_cast<int>(text.size());
  return shortest <= length && length <= longest && text.starts_with(beginning.View()) && text.ends_with(end.View()) &&
         least.View() <= text && text <= greatest.View() && (CharactersOf(text) & ~characters).none();
}

std::optional<ZORString> Shape::Only() const {
  if (orGreatest || shortest != longest || !IsWhole()) return std::nullopt;
  return beginning;
}

void Shape::Meet(const Shape& other) {
  const bool greatestToo = Admits(GreatestText().View()) && other.Admits(GreatestText().View());
  const bool begins =
      beginning.View().starts_with(other.beginning.View()) || other.beginning.View().starts_with(beginning.View());
  const bool ends = end.View().ends_with(other.end.View()) || other.end.View().ends_with(end.View());
  orGreatest = greatestToo;
  if (!begins || !ends) return BecomeNothing();
  shortest = std::max(shortest, other.shortest);
  longest = std::min(longest, other.longest);
  if (LengthOf(beginning) < LengthOf(other.beginning)) beginning = other.beginning;
  if (LengthOf(end) < LengthOf(other.end)) end = other.end;
  if (least < other.least) least = other.least;
  if (other.greatest < greatest) greatest = other.greatest;
  characters &= other.characters;
  Settle();
}

// What each part says of the others.
void Shape::Settle() {
  if (least > greatest) return BecomeNothing();
  const std::string_view common = CommonBeginning(least.View(), greatest.View());
  if (common.size() > beginning.View().size()) {
    if (!common.starts_with(beginning.View())) return BecomeNothing();
    beginning = ZORString(common);
  }
  if (characters.none()) longest = std::min(longest, 0);
  if (LengthOf(least) > 0) shortest = std::max(shortest, 1);
  while (shortest <= longest && !Fits(shortest)) ++shortest;
  const Characters needed = CharactersOf(beginning.View()) | CharactersOf(end.View());
  if (shortest > longest || (needed & ~characters).any()) return BecomeNothing();
  if (shortest == longest) Join(longest);
  const bool greatestToo = std::exchange(orGreatest, false) && !Admits(GreatestText().View());
  const bool isOne = shortest == longest && IsWhole();
  const bool isNone = shortest > longest || (isOne && !Admits(beginning.View()));
  if (isOne && !isNone) Become(ZORString(beginning));
  orGreatest = greatestToo;
  if (isNone) BecomeNothing();
}

// Whether beginning and end agree where they overlap in a text of that length.
bool Shape::Fits(int length) const {
  const std::string_view head = beginning.View(), tail = end.View();
  if (length < LengthOf(beginning) || length < LengthOf(end)) return false;
  const std::size_t apart = static_cast<std::size_t>(length) - tail.size();  // where the end begins
  return apart >= head.size() || tail.starts_with(head.substr(apart));
}

// A text of that length is its beginning and end alone.
void Shape::Join(int length) {
  const int more = length - LengthOf(beginning);
  if (more <= LengthOf(end))
    beginning.Append(ZORString(end.View().substr(end.View().size() - static_cast<std::size_t>(more))));
}

void Shape::Include(const Shape& other) {
  if (other.shortest > other.longest) {
    orGreatest = orGreatest || other.orGreatest;
    return;
  }
  const bool either = orGreatest || other.orGreatest;
  if (shortest > longest) {
    *this = other;
  } else {
    shortest = std::min(shortest, other.shortest);
    longest = std::max(longest, other.longest);
    Shorten(beginning, CommonBeginning(beginning.View(), other.beginning.View()));
    Shorten(end, CommonEnd(end.View(), other.end.View()));
    if (other.least < least) least = other.least;
    if (greatest < other.greatest) greatest = other.greatest;
    characters |= other.characters;
  }
  orGreatest = either;
}

Shape Shape::Plain() const {
  Shape plain = *this;
  plain.orGreatest = false;
  if (orGreatest) plain.Include(Shape(GreatestText()));
  return plain;
}

namespace {

// As a class of a regular expression writes them: [0-9a-f].
std::string Show(const Characters& characters) {
  std::string shown;
  for (std::size_t bit = 0, last; bit < characters.size(); bit = last + 1) {
    last = bit;
    if (!characters[bit]) continue;
    while (last + 1 < characters.size() && characters[last + 1]) ++last;
    shown += CharacterAt(bit);
    if (last > bit + 1) shown += '-';
    if (last > bit) shown += CharacterAt(last);
  }
  return '[' + shown + ']';
}

}  // namespace

std::string Describe(const Shape& shape) {
  std::string described;
  const auto quoted = [](const ZORString& text) { return '"' + std::string(text.View()) + '"'; };
  if (shape.beginning != "" || shape.end != "")
    described += '"' + std::string(shape.beginning.View()) + "\u2026" + std::string(shape.end.View()) + "\", ";
  if (shape.beginning < shape.least) described += "from " + quoted(shape.least) + ", ";
  if (shape.greatest < shape.Ceiling()) described += "to " + quoted(shape.greatest) + ", ";
  described += std::to_string(shape.shortest);
  if (shape.longest != shape.shortest) described += " to " + std::to_string(shape.longest);
  described += shape.longest == 1 ? " character" : " characters";
  if (!shape.characters.all()) described += " of " + Show(shape.characters);
  return described + (shape.orGreatest ? ", or Max" : "");
}

ZORString Shape::Lowest() const { return std::max(least, beginning); }

ZORString Shape::Highest() const { return orGreatest ? GreatestText() : std::min(greatest, Ceiling()); }

// The greatest text with the beginning.
ZORString Shape::Ceiling() const {
  if (LengthOf(beginning) == 0) return GreatestText();
  return ZORString::Concatenation(beginning, {ZORChar('z'), kTextLimit - beginning.View().size()});
}

}  // namespace zornet
