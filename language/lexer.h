// The words of the model language.
#pragma once

#include <cstdint>
#include <string_view>

#include "language/diagnostics.h"
#include "language/source.h"

namespace zornet {

struct Token {
  enum Type { Name, Number, Text, DotDot, Mark, Broken, End };

  Type type = End;
  Extent extent;
  std::string_view text;    // as it stands; of a Text without the quotes
  std::int64_t number = 0;  // of a Number

  bool Is(std::string_view word) const { return (type == Name || type == Mark) && text == word; }
};

// Tokenises a source. An invalid token is reported once, as an error, and comes as Broken.
class Lexer {
 public:
  Lexer(const Source& source, Diagnostics& diagnostics)
      : mSource(source), mText(source.Text()), mDiagnostics(diagnostics) {}
  Token Next();

 private:
  void SkipBlanks();
  Token Make(Token::Type type, std::size_t length);
  Token NextName();
  Token NextNumber();
  Token NextText();
  Token NextBroken();
  void CheckText(Extent inside);
  bool StartsNumber() const;
  char At(std::size_t offset) const { return mNext + offset < mText.size() ? mText[mNext + offset] : '\0'; }

  const Source& mSource;
  std::string_view mText;
  Diagnostics& mDiagnostics;
  std::size_t mNext = 0;
};

}  // namespace zornet
