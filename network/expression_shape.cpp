#include "network/expression_shape.h"

#include <algorithm>
#include <optional>

namespace zornet {

namespace {

constexpr int kLimit = static_cast<int>(kTextLimit);

Shape OneOf(const Characters& characters) {
  Shape shape;
  if (characters.count() == 1) {
    for (std::size_t bit = 0; bit < characters.size(); ++bit) {
      const char c = CharacterAt(bit);
      if (characters[bit]) shape = Shape(ZORString(&c, 1));
    }
    return shape;
  }
  shape.characters = characters;
  shape.shortest = shape.longest = 1;
  return shape;
}

// Reads an expression that the engine has accepted. Empty where it gives up.
class Reader {
 public:
  explicit Reader(std::string_view rest) : mRest(rest) {}

  std::optional<Shape> Read() {
    auto shape = Alternatives(0);
    return mRest.empty() ? shape : std::nullopt;
  }

 private:
  static constexpr int kDeepest = 100;  // groups inside each other

  bool Take(char c) {
    if (!mRest.starts_with(c)) return false;
    mRest.remove_prefix(1);
    return true;
  }

  std::optional<Shape> Alternatives(int depth) {
    auto all = Sequence(depth);
    while (all && Take('|')) {
      const auto other = Sequence(depth);
      if (!other) return std::nullopt;
      all->Include(*other);
    }
    return all;
  }

  std::optional<Shape> Sequence(int depth) {
    Shape joined{ZORString()};
    while (!mRest.empty() && mRest[0] != '|' && mRest[0] != ')') {
      auto part = Atom(depth);
      if (part) part = Repeated(*part);
      if (!part) return std::nullopt;
      const Shape both[] = {joined, *part};
      joined = Shape::Concatenation(both);
      joined.shortest = std::min(joined.shortest, kLimit + 1);  // a text in the domain has no more
      joined.longest = std::min(joined.longest, kLimit + 1);
      joined.least = ZORString();
    }
    return joined;
  }

  std::optional<Shape> Atom(int depth) {
    const char c = mRest[0];
    mRest.remove_prefix(1);
    if (c == '(') return Group(depth + 1);
    if (c == '[') return Class();
    if (c == '.') return OneOf(Characters().set());
    if (c == '\\') return Escaped();
    if (c == '^' || c == '$' || c == '*' || c == '+' || c == '?' || c == '{') return std::nullopt;
    return OneOf(CharactersOf({&c, 1}));
  }

  std::optional<Shape> Group(int depth) {
    if (mRest.starts_with("?:")) mRest.remove_prefix(2);
    if (mRest.starts_with('?') || depth > kDeepest) return std::nullopt;
    auto inside = Alternatives(depth);
    return Take(')') ? inside : std::nullopt;
  }

  std::optional<Shape> Escaped() {
    const auto characters = EscapedCharacters();
    return characters ? std::optional(OneOf(*characters)) : std::nullopt;
  }

  // Behind a backslash.
  std::optional<Characters> EscapedCharacters() {
    if (mRest.empty()) return std::nullopt;
    const char c = mRest[0];
    mRest.remove_prefix(1);
    const bool isLetter = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
    if (!isLetter && !(c >= '0' && c <= '9')) return CharactersOf({&c, 1});
    const Characters digits = Range('0', '9');
    const Characters words = digits | Range('A', 'Z') | Range('a', 'z') | CharactersOf("_");
    switch (c) {
      case 'd':
        return digits;
      case 'D':
        return ~digits;
      case 'w':
        return words;
      case 'W':
        return ~words;
      case 's':
        return CharactersOf(" ");
      case 'S':
        return ~CharactersOf(" ");
      default:
        return std::nullopt;
    }
  }

  static Characters Range(char first, char last) {
    Characters range;
    for (std::size_t bit = 0; bit < range.size(); ++bit)
      range[bit] = first <= CharacterAt(bit) && CharacterAt(bit) <= last;
    return range;
  }

  // Behind the opening bracket.
  std::optional<Shape> Class() {
    const bool negated = Take('^');
    Characters characters;
    for (bool isFirst = true; isFirst || !mRest.starts_with(']'); isFirst = false) {
      const auto member = Member();
      if (!member) return std::nullopt;
      characters |= *member;
    }
    Take(']');
    return OneOf(negated ? ~characters : characters);
  }

  std::optional<Characters> Member() {
    if (mRest.empty() || mRest.starts_with("[:")) return std::nullopt;
    const char first = mRest[0];
    mRest.remove_prefix(1);
    if (first == '\\') {
      const auto escaped = EscapedCharacters();
      const bool isRange = mRest.starts_with('-') && !mRest.starts_with("-]");
      return isRange ? std::nullopt : escaped;
    }
    if (!mRest.starts_with('-') || mRest.starts_with("-]") || mRest.size() < 2) return CharactersOf({&first, 1});
    const char last = mRest[1];
    mRest.remove_prefix(2);
    return last == '\\' ? std::nullopt : std::optional(Range(first, last));
  }

  std::optional<Shape> Repeated(Shape part) {
    while (!mRest.empty()) {
      int least = 0, most = kLimit + 1;
      if (Take('+')) {
        least = 1;
      } else if (Take('?')) {
        most = 1;
      } else if (mRest.starts_with('{')) {
        if (!Counts(least, most)) return std::nullopt;
      } else if (!Take('*')) {
        break;
      }
      Take('?');  // fewer first: the same texts match
      part = Times(part, least, most);
    }
    return part;
  }

  // {2}, {2,} or {2,5}.
  bool Counts(int& least, int& most) {
    mRest.remove_prefix(1);
    if (!Number(least)) return false;
    most = least;
    if (Take(',') && !Number(most)) most = kLimit + 1;
    return Take('}');
  }

  bool Number(int& number) {
    if (mRest.empty() || mRest[0] < '0' || mRest[0] > '9') return false;
    for (number = 0; !mRest.empty() && mRest[0] >= '0' && mRest[0] <= '9'; mRest.remove_prefix(1))
      number = std::min(10 * number + (mRest[0] - '0'), kLimit + 1);
    return true;
  }

  static Shape Times(const Shape& part, int least, int most) {
    if (most == 0) return Shape(ZORString());
    Shape repeated;
    repeated.shortest = std::min(part.shortest * least, kLimit + 1);
    repeated.longest = std::min(part.longest * most, kLimit + 1);
    repeated.characters = part.characters;
    if (least > 0) {
      repeated.beginning = part.beginning;
      repeated.end = part.end;
    }
    if (least != most || least > kLimit || !part.IsWhole()) return repeated;
    for (int i = 1; i < least && repeated.beginning.GetLengthInChar() <= kLimit; ++i)
      repeated.beginning.Append(part.beginning);
    repeated.end = repeated.beginning;
    return repeated;
  }

  std::string_view mRest;
};

}  // namespace

Shape ShapeOfExpression(std::string_view expression) {
  Shape forced;
  if (const auto read = Reader(expression).Read()) forced.Meet(*read);
  return forced;
}

}  // namespace zornet
