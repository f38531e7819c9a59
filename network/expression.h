// A regular expression over texts. Matching takes time linear in the text, whatever the expression.
#pragma once

#include <re2/re2.h>

#include <string>
#include <string_view>

namespace zornet {

class Expression {
 public:
  explicit Expression(const std::string& written);  // throws ExpressionError

  bool Matches(std::string_view text) const { return RE2::FullMatch({text.data(), text.size()}, mExpression); }

 private:
  RE2 mExpression;
};

}  // namespace zornet
