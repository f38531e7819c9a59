#include "language/lexer.h"

#include <fmt/core.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <limits>
#include <utility>

#include "host/ZORText.h"
#include "module/texts.h"

namespace zornet {

namespace {

enum Classes : unsigned char {
  Letter = 1,
  Digit = 2,
  Mark = 4,
  Blank = 8,
  Comment = 16,
  EndsRun = 32
};  // of characters

constexpr std::array<unsigned char, 256> kClasses = [] {
  std::array<unsigned char, 256> classes{};
  const auto put = [&](std::string_view characters, Classes in) {
    for (const char c : characters) classes[static_cast<unsigned char>(c)] |= in;
  };
  put("abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ_", Letter);
  put("0123456789", Digit);
  put(",();:{}[]|=", Mark);
  put(" \t\n\v\f\r", Blank);
  put("%/#", Comment);     // one may begin there
  put("\"\n\\", EndsRun);  // in a text
  return classes;
}();

bool Is(char c, int classes) { return (kClasses[static_cast<unsigned char>(c)] & classes) != 0; }

std::string NameOf(std::string_view character) {
  const auto code = static_cast<unsigned char>(character.front());
  if (code < ' ' || code == 0x7F) return fmt::format("character {}", code);
  return fmt::format("'{}'", character);
}

// Bytes that stand for one character in quotes. Nothing else is escaped.
std::size_t WrittenLength(std::string_view text) {
  return text.size() > 1 && text[0] == '\\' && (text[1] == '"' || text[1] == '\\') ? 2 : 1;
}

}  // namespace

std::string Unescaped(const Token& token) {
  if (!token.escaped) return std::string(token.text);
  std::string text;
  for (std::size_t i = 0, length; i < token.text.size(); i += length) {
    length = WrittenLength(token.text.substr(i));
    text += token.text[i + length - 1];
  }
  return text;
}

std::size_t PositionOf(const Token& token, std::size_t character) {
  if (token.type == Token::Line) return token.extent.begin + character;
  std::size_t at = 0;
  for (; character > 0 && at < token.text.size(); --character) at += WrittenLength(token.text.substr(at));
  return token.extent.begin + 1 + at;
}

bool CheckText(const Token& token, Diagnostics& diagnostics) {
  const auto wrong = std::find_if_not(token.text.begin(), token.text.end(), zor::IsInAlphabet);
  if (wrong != token.text.end()) {
    const auto at = static_cast<std::size_t>(wrong - token.text.begin());
    const std::string_view character = token.text.substr(at, CharacterLength(token.text.substr(at)));
    const std::size_t quote = token.type == Token::Text ? 1 : 0;
    diagnostics.Error({token.extent.begin + quote + at, character.size()},
                      fmt::format("{} is no character of a text: those are the ones from space to z, without {{|}}~",
                                  NameOf(character)));
    return false;
  }
  if (token.text.size() <= zor::kLengthLimit) return true;
  const std::size_t length = Unescaped(token).size();
  if (length <= zor::kLengthLimit) return true;
  diagnostics.Error(token.extent,
                    fmt::format("a text has at most {} characters, this one has {}", zor::kLengthLimit, length));
  return false;
}

// Behind the last error that is told there is nothing worth reading.
Token Lexer::Next() {
  if (mDiagnostics.Stopped()) mNext = mText.size();
  SkipBlanks();
  if (mNext >= mText.size()) return Make(Token::End, 0);
  const char c = At(0);
  if (Is(c, Letter)) return NextName();
  if (StartsNumber()) return NextNumber();
  if (c == '"') return NextText();
  if (c == '.' && At(1) == '.') return Make(Token::DotDot, 2);
  if (Is(c, Mark)) return Make(Token::Mark, 1);
  return NextBroken();
}

void Lexer::SkipBlanks() {
  while (mNext < mText.size()) {
    const char c = mText[mNext];
    if (Is(c, Blank)) {
      ++mNext;
    } else if (!Is(c, Comment) || !SkipsComment()) {
      return;
    }
  }
}

// What other languages begin comments with is told once, and skipped as they would.
bool Lexer::SkipsComment() {
  const bool block = At(0) == '/' && At(1) == '*', line = At(0) == '#' || (At(0) == '/' && At(1) == '/');
  if (At(0) != '%' && !block && !line) return false;
  if (At(0) != '%' && !std::exchange(mToldComment, true))
    mDiagnostics.Error(Here(At(0) == '#' ? 1 : 2), "a comment begins with '%' and ends with its line");
  const std::size_t end = block ? mText.find("*/", mNext + 2) : mText.find('\n', mNext);
  mNext = end == std::string_view::npos ? mText.size() : end + (block ? 2 : 0);
  return true;
}

Token Lexer::Make(Token::Type type, std::size_t length) {
  const Token token{Here(length), mText.substr(mNext, length), 0, type};
  mNext += length;
  return token;
}

Token Lexer::NextName() {
  std::size_t length = 1;
  while (Is(At(length), Letter | Digit)) ++length;
  return Make(Token::Name, length);
}

bool Lexer::StartsNumber() const { return Is(At(0), Digit) || (At(0) == '-' && Is(At(1), Digit)); }

Token Lexer::NextNumber() {
  std::size_t length = 1;
  while (Is(At(length), Digit)) ++length;
  Token token = Make(Token::Number, length);
  const auto [end, error] = std::from_chars(token.text.data(), token.text.data() + token.text.size(), token.number);
  using Limits = std::numeric_limits<ZORLong>;
  if (error == std::errc()) return token;
  mDiagnostics.Error(token.extent, fmt::format("an integer lies between {} and {}", Limits::min(), Limits::max()));
  token.type = Token::Broken;
  return token;
}

// From a position in a text to the next quote or backslash, or to the end of the line.
std::size_t Lexer::EndOfRun(std::size_t from) const {
  while (from < mText.size() && !Is(mText[from], EndsRun)) ++from;
  return from;
}

// A text ends at its closing quote; one that lacks it ends with its line, so that the next line is read in peace.
Token Lexer::NextText() {
  std::size_t close = EndOfRun(mNext + 1);
  bool escaped = false;
  for (; close < mText.size() && mText[close] == '\\'; close = EndOfRun(close + WrittenLength(mText.substr(close))))
    escaped = true;
  if (close == mText.size() || mText[close] == '\n') {
    const std::size_t length = mText.substr(mNext, close - mNext).find_last_not_of("\r \t") + 1;
    mDiagnostics.Error(Here(length), "the text has no closing quote on its line");
    return Make(Token::Broken, length);
  }
  const std::string_view inside = mText.substr(mNext + 1, close - mNext - 1);
  if (escaped) CheckEscapes(inside);
  Token token = Make(Token::Text, inside.size() + 2);
  token.text = inside;
  token.escaped = escaped;
  return token;
}

void Lexer::CheckEscapes(std::string_view inside) {
  for (std::size_t at = inside.find('\\'); at != std::string_view::npos; at = inside.find('\\', at)) {
    const std::size_t length = WrittenLength(inside.substr(at));
    at += length;
    if (length == 2) continue;
    const std::size_t next = at < inside.size() ? CharacterLength(inside.substr(at)) : 0;
    mDiagnostics.Error({mBegin + mNext + at, 1 + next},
                       fmt::format("'{}' is no escape: a quote is written \\\" and a backslash \\\\",
                                   inside.substr(at - 1, 1 + next)));
    return;
  }
}

// Letters outside ASCII come as one word.
Token Lexer::NextBroken() {
  const std::string_view rest = mText.substr(mNext);
  std::size_t length = 0;
  while (length < rest.size() && CharacterLength(rest.substr(length)) > 1)
    length += CharacterLength(rest.substr(length));
  const Token token = Make(Token::Broken, std::max<std::size_t>(length, 1));
  mDiagnostics.Error(token.extent, fmt::format("{} has no meaning here", NameOf(token.text)));
  return token;
}

}  // namespace zornet
