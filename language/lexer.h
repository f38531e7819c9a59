// The words of the model language.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "language/diagnostics.h"
#include "language/source.h"

namespace zornet {

struct Token {
  enum Type : char { Name, Number, Text, Line, DotDot, Mark, Broken, End };

  Extent extent;
  std::string_view text;    // as it stands; of a Text without the quotes
  std::int32_t number = 0;  // of a Number
  Type type = End;
  bool escaped = false;  // a Text that has backslashes

  bool Is(std::string_view word) const { return (type == Name || type == Mark) && text == word; }
};

// What a Text in quotes or a Line of a file says. Where a character of it stands in the source.
std::string Unescaped(const Token& token);
std::size_t PositionOf(const Token& token, std::size_t character);

// Whether it says a text of the domain; if not that is an error.
bool CheckText(const Token& token, Diagnostics& diagnostics);

// Tokenises a file of a source. An invalid token is reported once, as an error, and comes as Broken.
class Lexer {
 public:
  Lexer(const Source& source, std::size_t file, Diagnostics& diagnostics)
      : mBegin(source.All(file).begin), mText(source.Text(source.All(file))), mDiagnostics(diagnostics) {}
  Token Next();

 private:
  void SkipBlanks();
  bool SkipsComment();
  Token Make(Token::Type type, std::size_t length);
  Token NextName();
  Token NextNumber();
  Token NextText();
  Token NextBroken();
  std::size_t EndOfRun(std::size_t from) const;
  void CheckEscapes(std::string_view inside);
  Extent Here(std::size_t length) const { return {mBegin + mNext, length}; }
  bool StartsNumber() const;
  char At(std::size_t offset) const { return mNext + offset < mText.size() ? mText[mNext + offset] : '\0'; }

  const std::size_t mBegin;  // of the file in the source
  const std::string_view mText;
  Diagnostics& mDiagnostics;
  std::size_t mNext = 0;
  bool mToldComment = false;
};

}  // namespace zornet
