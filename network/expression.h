// A regular expression over texts. Matching takes time linear in the text, whatever the expression.
#pragma once

#include <re2/re2.h>

#include <string>
#include <string_view>

#include "network/shape.h"

namespace zornet {

class Expression {
 public:
  explicit Expression(const std::string& written);  // throws ExpressionError

  const Shape& Forced() const { return mForced; }  // of every text that matches
  bool Matches(std::string_view text) const { return RE2::FullMatch({text.data(), text.size()}, mExpression); }

 private:
  void Force();

  RE2 mExpression;
  Shape mForced;
};

}  // namespace zornet
