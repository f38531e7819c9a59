#include "language/syntax.h"

#include <fmt/core.h>

#include <algorithm>
#include <initializer_list>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "language/inclusion.h"
#include "language/spelling.h"

namespace zornet {

namespace {

// Thrown where an item cannot be read on; it has been told.
struct Unreadable {};

constexpr std::string_view kItems[] = {"var", "set", "array", "constraint", "output", "include"};
constexpr std::string_view kOthers[] = {"var", "constraint", "output", "true", "false"};  // that are no names

bool IsAmong(std::string_view word, std::span<const std::string_view> words) {
  for (const std::string_view other : words) {
    if (word == other) return true;
  }
  return false;
}

bool IsReserved(std::string_view word) { return IsAmong(word, kTypes) || IsAmong(word, kOthers); }

Extent Join(Extent from, Extent to) { return {from.begin, to.End() - from.begin}; }

bool AreTexts(std::span<const Word> words) {
  return std::all_of(words.begin(), words.end(), [](const Word& word) { return word.type == Word::Text; });
}

// Reads the items of one file.
class Parser {
 public:
  Parser(Inclusion& inclusion, std::size_t file, Syntax& syntax, Diagnostics& diagnostics)
      : mInclusion(inclusion),
        mSource(inclusion.GetSource()),
        mDiagnostics(diagnostics),
        mLexer(mSource, file, diagnostics),
        mSyntax(syntax) {
    Take();
  }

  bool IsAtEnd() const { return mToken.type == Token::End || mDiagnostics.Stopped(); }
  std::optional<std::size_t> ReadItem();  // the file whose items come next

 private:
  void Item();
  void Declaration();
  void NamedSet();
  void Array();
  void Include();
  void Constraint();
  void Output();
  void Finish(DeclarationSyntax& declaration);
  DetailSyntax Value();
  Range Indices();
  TypeSyntax Type(bool ofTexts = true);
  TypeSyntax NamedType();
  TypeSyntax Basic();
  TypeSyntax Interval();
  Range Braces();
  void ReadBraces();
  Range Lines(Extent word);
  Range LinesOf(std::size_t file);
  Range Rows();
  Range Members(Word (Parser::*member)());
  void ReadMembers(Word (Parser::*member)());
  std::vector<std::string> TextsOf(std::span<const Word> words);
  std::span<const Word> WordsFrom(std::size_t begin) const { return std::span(mWords).subspan(begin); }
  Range KeepFrom(std::size_t begin);
  Range Keep(std::initializer_list<Word> words) { return mSyntax.members.Keep({words.begin(), words.size()}); }
  Word Literal();
  Word Constant();
  Word Argument();
  Word List();
  Word Member();
  Word NameOrElement();
  Token NewName(std::string_view what);

  Token Take();
  Token Expect(std::string_view mark, std::string_view where);
  [[noreturn]] void Fail(const std::string& expected);
  void Recover();
  bool StartsLine(const Token& token) const;

  Inclusion& mInclusion;
  const Source& mSource;
  Diagnostics& mDiagnostics;
  Lexer mLexer;
  Token mToken;  // the next
  Extent mLast;  // of the one before
  Token mDeclared;
  std::vector<Word> mWords;              // of what is being read, members behind what they are members of
  std::vector<std::string_view> mViews;  // of texts that are put in order
  std::optional<std::size_t> mIncluded;
  Syntax& mSyntax;
};

std::optional<std::size_t> Parser::ReadItem() {
  mDeclared = Token();
  mIncluded.reset();
  mWords.clear();
  try {
    Item();
  } catch (const Unreadable&) {
    if (mDeclared.type == Token::Name) mSyntax.broken.push_back(mDeclared);
    Recover();
  }
  return mIncluded;
}

void Parser::Item() {
  if (mToken.Is("var")) return Declaration();
  if (mToken.Is("constraint")) return Constraint();
  if (mToken.Is("set")) return NamedSet();
  if (mToken.Is("array")) return Array();
  if (mToken.Is("output")) return Output();
  if (mToken.Is("include")) return Include();
  const std::string near = mToken.type == Token::Name ? Suggestion(mToken.text, kItems) : "";
  Fail("'var', 'set', 'array', 'constraint', 'output' or 'include'" + near);
}

void Parser::Declaration() {
  DeclarationSyntax declaration;
  Take();
  declaration.type = Type();
  Expect(":", "behind the type");
  declaration.name = mDeclared = NewName("the name of the variable");
  if (mToken.Is("=")) {
    Take();
    declaration.details = std::make_unique<DetailSyntax>(Value());
  }
  Finish(declaration);
}

DetailSyntax Parser::Value() {
  const Token first = mToken;
  const Range value = first.Is("lines") ? (Take(), Lines(first.extent)) : first.Is("{") ? Braces() : Keep({Constant()});
  return {value, first.Is("{") || first.Is("lines"), Join(first.extent, mLast), {}};
}

void Parser::Finish(DeclarationSyntax& declaration) {
  Expect(";", "at the end of the declaration");
  mSyntax.declarations.Add(std::move(declaration));
}

// set of string: NAME = SET;
void Parser::NamedSet() {
  DeclarationSyntax declaration;
  declaration.what = DeclarationSyntax::Set;
  Take();
  Expect("of", "behind 'set'");
  const Token members = mToken;
  if (!members.Is("string") && !members.Is("int")) Fail("'string' or 'int' behind 'set of'");
  Take();
  Expect(":", "behind the type");
  declaration.name = mDeclared = NewName("the name of the set");
  Expect("=", "behind the name of the set");
  const Token first = mToken;
  if (!first.Is("{") && !first.Is("lines") && first.type != Token::Number)
    Fail("a set: {\"a\", \"b\"}, lines(\"file\"), {1, 3} or 1..9");
  declaration.type = Type(members.Is("string"));
  if (members.Is("string")) declaration.type.sort = Sort::TextSet;
  if (members.Is("int") && declaration.type.sort != Sort::Interval) declaration.type.sort = Sort::IntegerSet;
  Finish(declaration);
}

// array [FIRST..LAST] of var TYPE: NAME; or array [FIRST..LAST] of TYPE: NAME = [CONSTANT, ...];
void Parser::Array() {
  DeclarationSyntax declaration;
  Take();
  declaration.details = std::make_unique<DetailSyntax>();
  declaration.details->indices = Indices();
  Expect("of", "behind the indices of the array");
  const bool variables = mToken.Is("var");
  declaration.what = variables ? DeclarationSyntax::Variables : DeclarationSyntax::Constants;
  if (variables) Take();
  if (!variables && (mToken.Is("set") || !IsAmong(mToken.text, kTypes)))
    Fail("'var' and a type, or for constants 'string', 'int' or 'bool'");
  declaration.type = variables ? Type() : Basic();
  Expect(":", "behind the type");
  declaration.name = mDeclared = NewName("the name of the array");
  if (!variables) {
    Expect("=", "behind the name of an array without 'var'");
    const Token first = mToken;
    Expect("[", "ahead of the constants");
    declaration.details->value = Members(&Parser::Constant);
    Expect("]", "behind the constants");
    declaration.details->valueExtent = Join(first.extent, mLast);
  }
  Finish(declaration);
}

Range Parser::Indices() {
  Expect("[", "behind 'array'");
  if (mToken.type != Token::Number) Fail("the first and the last index: 1..9");
  const Range indices = Interval().members;
  Expect("]", "behind the indices");
  return indices;
}

// Texts that could be of that type need no words of their own: nothing can be wrong with them any more.
TypeSyntax Parser::Type(bool ofTexts) {
  if (mToken.type == Token::Number) return Interval();
  const Token first = mToken;
  TypeSyntax type;
  if (first.Is("{")) {
    const std::size_t begin = mWords.size();
    ReadBraces();
    const auto words = WordsFrom(begin);
    type.sort = words.front().type == Word::Text ? Sort::TextSet : Sort::IntegerSet;
    if (ofTexts && AreTexts(words)) {
      type.texts = TextsOf(words);
      mWords.resize(begin);
    } else {
      type.members = KeepFrom(begin);
    }
  } else {
    type = NamedType();
  }
  type.extent = Join(first.extent, mLast);
  return type;
}

TypeSyntax Parser::Interval() {
  const Word first = Constant();
  if (mToken.type != Token::DotDot) Fail("'..' and the upper end of the interval");
  Take();
  if (mToken.type != Token::Number) Fail("the upper end of the interval");
  const Word last = Constant();
  return {Sort::Interval, Join(first.token.extent, last.token.extent), Keep({first, last})};
}

// Texts without escapes are put in order as they are written, which costs less than later.
std::vector<std::string> Parser::TextsOf(std::span<const Word> words) {
  std::vector<std::string> texts;
  texts.reserve(words.size());
  mViews.clear();
  for (const Word& word : words) {
    if (word.token.escaped) break;
    mViews.push_back(word.token.text);
  }
  if (mViews.size() == words.size()) {
    SortUnique(mViews);
    texts.assign(mViews.begin(), mViews.end());
  } else {
    for (const Word& word : words) texts.push_back(Unescaped(word.token));
    SortUnique(texts);
  }
  return texts;
}

TypeSyntax Parser::NamedType() {
  const Token word = mToken;
  if (IsAmong(word.text, kTypes)) return Basic();
  if (word.type != Token::Name || IsReserved(word.text)) Fail(std::string(kAnyType));
  Take();
  if (word.Is("lines") && mToken.Is("(")) return {Sort::TextSet, {}, Lines(word.extent)};
  if (mToken.Is(":") || mToken.type == Token::Name) return {Sort::TextSet, {}, Keep({{Word::Name, word}})};
  mDiagnostics.Error(word.extent, fmt::format("expected {}{}", kAnyType, Suggestion(word.text, kTypes)));
  throw Unreadable();
}

TypeSyntax Parser::Basic() {
  const Token word = mToken;
  if (word.Is("string") || word.Is("int") || word.Is("bool")) {
    Take();
    return {word.Is("string") ? Sort::Text : word.Is("int") ? Sort::Integer : Sort::Boolean};
  }
  Take();
  if (mToken.Is("of")) Take();
  if (!mToken.Is("string")) Fail("'string' behind 'set'");
  Take();
  return {Sort::TextSet};
}

Range Parser::Braces() {
  const std::size_t begin = mWords.size();
  ReadBraces();
  return KeepFrom(begin);
}

void Parser::ReadBraces() {
  Expect("{", "here");
  if (mToken.Is("}")) Fail("at least one text or integer between the braces");
  ReadMembers(&Parser::Constant);
  Expect("}", "at the end of the set");
}

// Behind the word lines: a text on each line of a file.
Range Parser::Lines(Extent word) {
  Expect("(", "behind 'lines'");
  if (mToken.type != Token::Text) Fail("the name of a file in quotes");
  const Token path = Take();
  Expect(")", "behind the name of the file");
  const std::optional<std::size_t> file = mInclusion.Load(path);
  if (!file) throw Unreadable();
  mSyntax.embedded.push_back({Join(word, mLast), Embedded::Set, *file});
  const auto [known, isNew] = mSyntax.lines.try_emplace(*file);
  if (isNew) known->second = LinesOf(*file);
  if (known->second.count > 0) return known->second;
  mDiagnostics.Error(path.extent, fmt::format("'{}' has no lines, and a set has at least one text",
                                              mSource.NameAt(mSource.All(*file).begin)));
  throw Unreadable();
}

Range Parser::LinesOf(std::size_t file) {
  const std::size_t begin = mWords.size();
  for (const Extent line : mSource.LinesOf(file)) {
    mWords.push_back({Word::Text, {line, mSource.Text(line), 0, Token::Line}});
    CheckText(mWords.back().token, mDiagnostics);
  }
  return KeepFrom(begin);
}

Range Parser::Members(Word (Parser::*member)()) {
  const std::size_t begin = mWords.size();
  ReadMembers(member);
  return KeepFrom(begin);
}

void Parser::ReadMembers(Word (Parser::*member)()) {
  mWords.push_back((this->*member)());
  while (mToken.Is(",")) {
    Take();
    mWords.push_back((this->*member)());
  }
}

Range Parser::KeepFrom(std::size_t begin) {
  const Range range = mSyntax.members.Keep(WordsFrom(begin));
  mWords.resize(begin);
  return range;
}

// A constant where it must be one of the domain.
Word Parser::Constant() {
  const Word word = Literal();
  if (word.type == Word::Text) CheckText(word.token, mDiagnostics);
  return word;
}

Word Parser::Literal() {
  if (mToken.type == Token::Text) return {Word::Text, Take()};
  if (mToken.type == Token::Number) return {Word::Number, Take()};
  if (mToken.Is("true") || mToken.Is("false")) return {Word::Truth, Take()};
  Fail("a text in quotes, an integer, true or false");
}

Word Parser::Argument() {
  if (mToken.Is("[")) return List();
  return Member();
}

Word Parser::Member() {
  if (mToken.type == Token::Name && !IsReserved(mToken.text)) return NameOrElement();
  if (mToken.Is("{")) Fail("a variable or one constant, since a set stands in a declaration only");
  if (mToken.Is("[")) Fail("a variable or a constant, since a list holds no list");
  if (mToken.type == Token::Name && !mToken.Is("true") && !mToken.Is("false")) Fail("a variable or a constant");
  return Literal();
}

Word Parser::NameOrElement() {
  Token name = Take();
  if (!mToken.Is("[")) return {Word::Name, name};
  Take();
  if (mToken.type != Token::Number) Fail("the index, an integer");
  const Range index = Keep({Constant()});
  Expect("]", "behind the index");
  name.extent = Join(name.extent, mLast);
  return {Word::Element, name, index};
}

// [x, "a", w] or the rows of a table: [| "a", "b" | "c", "d" |]
Word Parser::List() {
  Word list{Word::List, Take()};
  if (mToken.Is("|")) {
    list.type = Word::Rows;
    list.members = Rows();
  } else if (mToken.Is("]")) {
    Fail("at least one member of the list");
  } else {
    list.members = Members(&Parser::Member);
  }
  Expect("]", "at the end of the list");
  list.token.extent = Join(list.token.extent, mLast);
  return list;
}

Range Parser::Rows() {
  const std::size_t begin = mWords.size();
  Take();
  do {
    Word row{Word::List, mToken};
    row.members = Members(&Parser::Constant);
    row.token.extent = Join(row.token.extent, mLast);
    mWords.push_back(row);
    Expect("|", "at the end of the row");
  } while (!mToken.Is("]"));
  return KeepFrom(begin);
}

Token Parser::NewName(std::string_view what) {
  if (mToken.type != Token::Name) Fail(std::string(what));
  if (IsReserved(mToken.text)) Fail(fmt::format("{}, and '{}' is a word of the language", what, mToken.text));
  return Take();
}

void Parser::Constraint() {
  ConstraintSyntax constraint;
  Take();
  if (mToken.type != Token::Name) Fail("the name of a constraint");
  constraint.name = Take();
  const std::size_t first = mSyntax.arguments.Size();
  Expect("(", "behind the name of the constraint");
  if (!mToken.Is(")")) mSyntax.arguments.Add(Argument());
  while (mToken.Is(",")) {
    Take();
    mSyntax.arguments.Add(Argument());
  }
  constraint.arguments = static_cast<std::uint32_t>(mSyntax.arguments.Size() - first);
  const Token close = Expect(")", "behind the arguments");
  constraint.extent = Join(constraint.name.extent, close.extent);
  Expect(";", "at the end of the constraint");
  mSyntax.constraints.Add(constraint);
}

void Parser::Output() {
  do {
    Take();
    if (mToken.type != Token::Name || IsReserved(mToken.text)) Fail("the name of a variable");
    mSyntax.outputs.push_back(NameOrElement());
  } while (mToken.Is(","));
  Expect(";", "at the end of the output");
}

void Parser::Include() {
  const Token first = Take();
  if (mToken.type != Token::Text) Fail("the name of a file in quotes");
  const Token path = Take();
  Expect(";", "behind the name of the file");
  const std::optional<std::size_t> file = mInclusion.Load(path);
  if (!file) return;
  const bool isNew = mInclusion.Include(*file);
  mSyntax.embedded.push_back({Join(first.extent, mLast), isNew ? Embedded::Items : Embedded::Nothing, *file});
  if (isNew) mIncluded = file;
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
  const std::size_t line = mSource.LineAt(token.extent.begin).begin;
  return mSource.Text({line, token.extent.begin - line}).find_first_not_of(" \t") == std::string_view::npos;
}

}  // namespace

Range WordStore::Keep(std::span<const Word> words) {
  constexpr std::size_t kBlock = 256;
  if (mBlocks.empty() || mBlocks.back().capacity() - mBlocks.back().size() < words.size())
    mBlocks.emplace_back().reserve(std::max(kBlock, words.size()));
  std::vector<Word>& block = mBlocks.back();
  block.insert(block.end(), words.begin(), words.end());
  return {block.data() + block.size() - words.size(), words.size()};
}

// The items of a file stand where it is included.
Syntax Parse(Source& source, const Files& files, Diagnostics& diagnostics) {
  Syntax syntax;
  Inclusion inclusion(source, files, diagnostics);
  std::vector<std::unique_ptr<Parser>> open;  // each file names the next
  const auto begin = [&](std::size_t file) {
    open.push_back(std::make_unique<Parser>(inclusion, file, syntax, diagnostics));
  };
  begin(0);
  while (!open.empty()) {
    if (open.back()->IsAtEnd()) {
      open.pop_back();
    } else if (const auto included = open.back()->ReadItem()) {
      begin(*included);
    }
  }
  return syntax;
}

}  // namespace zornet
