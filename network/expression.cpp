#include "network/expression.h"

#include "network/ZORModel.h"

namespace zornet {

namespace {

RE2::Options Quiet() {
  RE2::Options options(RE2::Latin1);  // a byte is a character
  options.set_log_errors(false);
  return options;
}

}  // namespace

// The engine tells the faulty part, which at times is all of it.
Expression::Expression(const std::string& written) : mExpression(written, Quiet()) {
  if (mExpression.ok()) return;
  const std::size_t at = written.find(mExpression.error_arg());
  throw ExpressionError(mExpression.error(), at == std::string::npos ? 0 : at);
}

}  // namespace zornet
