#include "language/lexer.h"

#include <fmt/core.h>

#include <algorithm>
#include <charconv>
#include <limits>

#include "host/ZORText.h"
#include "module/texts.h"

namespace zornet {

namespace {

bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_'; }
bool IsBlank(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

std::string NameOf(std::string_view character) {
  const auto code = static_cast<unsigned char>(character.front());
  if (code < ' ' || code == 0x7F) return fmt::format("character {}", code);
  return fmt::format("'{}'", character);
}

}  // namespace

// Behind the last error that is told there is nothing worth reading.
Token Lexer::Next() {
  if (mDiagnostics.Stopped()) mNext = mText.size();
  SkipBlanks();
  if (mNext >= mText.size()) return Make(Token::End, 0);
  const char c = At(0);
  if (IsLetter(c)) return NextName();
  if (StartsNumber()) return NextNumber();
  if (c == '"') return NextText();
  if (c == '.' && At(1) == '.') return Make(Token::DotDot, 2);
  if (std::string_view("(){},:;=").find(c) != std::string_view::npos) return Make(Token::Mark, 1);
  return NextBroken();
}

void Lexer::SkipBlanks() {
  while (mNext < mText.size() && (IsBlank(At(0)) || At(0) == '%')) {
    mNext = At(0) == '%' ? std::min(mText.find('\n', mNext), mText.size()) : mNext + 1;
  }
}

Token Lexer::Make(Token::Type type, std::size_t length) {
  const Extent extent{mNext, length};
  mNext += length;
  return {type, extent, mSource.Text(extent)};
}

Token Lexer::NextName() {
  std::size_t length = 1;
  while (IsLetter(At(length)) || IsDigit(At(length))) ++length;
  return Make(Token::Name, length);
}

bool Lexer::StartsNumber() const { return IsDigit(At(0)) || (At(0) == '-' && IsDigit(At(1))); }

Token Lexer::NextNumber() {
  std::size_t length = 1;
  while (IsDigit(At(length))) ++length;
  Token token = Make(Token::Number, length);
  const auto [end, error] = std::from_chars(token.text.data(), token.text.data() + token.text.size(), token.number);
  using Limits = std::numeric_limits<ZORLong>;
  if (error == std::errc() && token.number >= Limits::min() && token.number <= Limits::max()) return token;
  mDiagnostics.Error(token.extent, fmt::format("an integer lies between {} and {}", Limits::min(), Limits::max()));
  token.type = Token::Broken;
  return token;
}

// A text ends at its closing quote; one that lacks it ends with its line, so that the next line is read in peace.
Token Lexer::NextText() {
  const std::size_t close = std::min(mText.find_first_of("\"\n", mNext + 1), mText.size());
  if (close == mText.size() || mText[close] == '\n') {
    const std::size_t length = mText.substr(mNext, close - mNext).find_last_not_of("\r \t") + 1;
    mDiagnostics.Error({mNext, length}, "the text has no closing quote on its line");
    return Make(Token::Broken, length);
  }
  const Extent inside{mNext + 1, close - mNext - 1};
  CheckText(inside);
  Token token = Make(Token::Text, close + 1 - mNext);
  token.text = mSource.Text(inside);
  return token;
}

void Lexer::CheckText(Extent inside) {
  const std::string_view text = mSource.Text(inside);
  for (std::size_t i = 0; i < text.size();) {
    const std::size_t length = CharacterLength(text.substr(i));
    if (!zor::IsInAlphabet(text[i])) {
      mDiagnostics.Error({inside.begin + i, length},
                         fmt::format("{} is no character of a text: those are the ones from space to z, without {{|}}~",
                                     NameOf(text.substr(i, length))));
      return;
    }
    i += length;
  }
  if (text.size() > zor::kLengthLimit) {
    mDiagnostics.Error(
        {inside.begin - 1, inside.length + 2},
        fmt::format("a text has at most {} characters, this one has {}", zor::kLengthLimit, text.size()));
  }
}

Token Lexer::NextBroken() {
  Token token = Make(Token::Broken, CharacterLength(mText.substr(mNext)));
  mDiagnostics.Error(token.extent, fmt::format("{} has no meaning here", NameOf(token.text)));
  return token;
}

}  // namespace zornet
