#include "language/syntax.h"

#include <fmt/core.h>

#include <string>
#include <string_view>
#include <utility>

#include "language/spelling.h"

namespace zornet {

namespace {

// Thrown where an item cannot be read on; it has been told.
struct Unreadable {};

constexpr std::string_view kItems[] = {"var", "constraint", "output"};
constexpr std::string_view kTypes[] = {"string", "set", "int", "bool"};

bool IsAmong(std::string_view word, std::span<const std::string_view> words) {
  for (const std::string_view other : words) {
    if (word == other) return true;
  }
  return false;
}

bool IsReserved(std::string_view word) {
  return IsAmong(word, kItems) || IsAmong(word, kTypes) || word == "true" || word == "false";
}

Extent Join(Extent from, Extent to) { return {from.begin, to.End() - from.begin}; }

class Parser {
 public:
  Parser(const Source& source, Diagnostics& diagnostics)
      : mSource(source), mDiagnostics(diagnostics), mLexer(source, diagnostics) {
    Take();
  }

  Syntax Parse() {
    while (mToken.type != Token::End && !mDiagnostics.Stopped()) Item();
    return std::move(mSyntax);
  }

 private:
  void Item();
  void Declaration();
  void Constraint();
  void Output();
  TypeSyntax Type();
  TypeSyntax NamedType();
  std::vector<Word> Braces();
  Word Constant();
  Word Argument();
  Token NewName();

  Token Take();
  Token Expect(std::string_view mark, std::string_view where);
  [[noreturn]] void Fail(const std::string& expected);
  void Recover();
  bool StartsLine(const Token& token) const;

  const Source& mSource;
  Diagnostics& mDiagnostics;
  Lexer mLexer;
  Token mToken;  // the next
  Extent mLast;  // of the one before
  Token mDeclared;
  Syntax mSyntax;
};

void Parser::Item() {
  mDeclared = Token();
  try {
    if (mToken.Is("var")) return Declaration();
    if (mToken.Is("constraint")) return Constraint();
    if (mToken.Is("output")) return Output();
    const std::string near = mToken.type == Token::Name ? Suggestion(mToken.text, kItems) : "";
    Fail("'var', 'constraint' or 'output'" + near);
  } catch (const Unreadable&) {
    if (mDeclared.type == Token::Name) mSyntax.broken.push_back(mDeclared);
    Recover();
  }
}

void Parser::Declaration() {
  DeclarationSyntax declaration;
  Take();
  declaration.type = Type();
  Expect(":", "behind the type");
  declaration.name = mDeclared = NewName();
  if (mToken.Is("=")) {
    Take();
    const Token first = mToken;
    declaration.setValue = mToken.Is("{");
    declaration.value = declaration.setValue ? Braces() : std::vector{Constant()};
    declaration.valueExtent = Join(first.extent, mLast);
  }
  Expect(";", "at the end of the declaration");
  mSyntax.declarations.push_back(std::move(declaration));
}

TypeSyntax Parser::Type() {
  const Token first = mToken;
  TypeSyntax type;
  if (first.Is("{")) {
    type.members = Braces();
    type.sort = type.members.front().type == Word::Text ? Sort::TextSet : Sort::IntegerSet;
  } else if (first.type == Token::Number) {
    type.members.push_back(Constant());
    if (mToken.type != Token::DotDot) Fail("'..' and the upper end of the interval");
    Take();
    if (mToken.type != Token::Number) Fail("the upper end of the interval");
    type.members.push_back(Constant());
    type.sort = Sort::Interval;
  } else {
    type = NamedType();
  }
  type.extent = Join(first.extent, mLast);
  return type;
}

TypeSyntax Parser::NamedType() {
  const Token word = mToken;
  if (!IsAmong(word.text, kTypes)) {
    const std::string near = word.type == Token::Name ? Suggestion(word.text, kTypes) : "";
    Fail("a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3} or bool" + near);
  }
  Take();
  if (word.Is("string")) return {Sort::Text, {}, {}};
  if (word.Is("int")) return {Sort::Integer, {}, {}};
  if (word.Is("bool")) return {Sort::Boolean, {}, {}};
  if (!mToken.Is("string")) Fail("'string' behind 'set'");
  Take();
  return {Sort::TextSet, {}, {}};
}

std::vector<Word> Parser::Braces() {
  std::vector<Word> members;
  Expect("{", "here");
  if (mToken.Is("}")) Fail("at least one text or integer between the braces");
  members.push_back(Constant());
  while (mToken.Is(",")) {
    Take();
    members.push_back(Constant());
  }
  Expect("}", "at the end of the set");
  return members;
}

Word Parser::Constant() {
  switch (mToken.type) {
    case Token::Text:
      return {Word::Text, Take()};
    case Token::Number:
      return {Word::Number, Take()};
    default:
      break;
  }
  if (mToken.Is("true") || mToken.Is("false")) return {Word::Truth, Take()};
  Fail("a text in quotes, an integer, true or false");
}

Word Parser::Argument() {
  if (mToken.type == Token::Name && !IsReserved(mToken.text)) return {Word::Name, Take()};
  if (mToken.Is("{")) Fail("a variable or one constant, since a set stands in a declaration only");
  if (mToken.type == Token::Name && !mToken.Is("true") && !mToken.Is("false")) Fail("a variable or a constant");
  return Constant();
}

Token Parser::NewName() {
  if (mToken.type != Token::Name) Fail("the name of the variable");
  if (IsReserved(mToken.text))
    Fail(fmt::format("the name of the variable, and '{}' is a word of the language", mToken.text));
  return Take();
}

void Parser::Constraint() {
  ConstraintSyntax constraint;
  Take();
  if (mToken.type != Token::Name) Fail("the name of a constraint");
  constraint.name = Take();
  constraint.firstArgument = mSyntax.arguments.size();
  Expect("(", "behind the name of the constraint");
  if (!mToken.Is(")")) mSyntax.arguments.push_back(Argument());
  while (mToken.Is(",")) {
    Take();
    mSyntax.arguments.push_back(Argument());
  }
  constraint.arguments = mSyntax.arguments.size() - constraint.firstArgument;
  const Token close = Expect(")", "behind the arguments");
  constraint.extent = Join(constraint.name.extent, close.extent);
  Expect(";", "at the end of the constraint");
  mSyntax.constraints.push_back(constraint);
}

void Parser::Output() {
  do {
    Take();
    if (mToken.type != Token::Name || IsReserved(mToken.text)) Fail("the name of a variable");
    mSyntax.outputs.push_back(Take());
  } while (mToken.Is(","));
  Expect(";", "at the end of the output");
}

Token Parser::Take() {
  mLast = mToken.extent;
  return std::exchange(mToken, mLexer.Next());
}

// What is missing at the end of a line is told there, not at the line below where it was noticed.
Token Parser::Expect(std::string_view mark, std::string_view where) {
  if (mToken.Is(mark)) return Take();
  const std::string expected = fmt::format("'{}' {}", mark, where);
  if (mToken.type == Token::End || StartsLine(mToken)) {
    mDiagnostics.Error({mLast.End(), 1}, "expected " + expected);
    throw Unreadable();
  }
  Fail(expected);
}

// A Broken word has been told by the lexer.
void Parser::Fail(const std::string& expected) {
  if (mToken.type == Token::End) {
    mDiagnostics.Error({mLast.End(), 1}, "the model ends here, expected " + expected);
  } else if (mToken.type != Token::Broken) {
    mDiagnostics.Error(mToken.extent, "expected " + expected);
  }
  throw Unreadable();
}

// Goes on behind the next semicolon, or at a line that begins like an item where the semicolon was forgotten. What
// was about to be declared on the way is no news when it is used.
void Parser::Recover() {
  while (mToken.type != Token::End && !mToken.Is(";")) {
    if (IsAmong(mToken.text, kItems) && mToken.type == Token::Name && StartsLine(mToken)) return;
    const Token before = Take();
    if (before.Is(":") && mToken.type == Token::Name) mSyntax.broken.push_back(mToken);
  }
  if (mToken.Is(";")) Take();
}

bool Parser::StartsLine(const Token& token) const {
  const std::string_view before = mSource.Text({0, token.extent.begin});
  const std::size_t last = before.find_last_not_of(" \t");
  return last == std::string_view::npos || before[last] == '\n';
}

}  // namespace

Syntax Parse(const Source& source, Diagnostics& diagnostics) { return Parser(source, diagnostics).Parse(); }

}  // namespace zornet
