#include "network/expression.h"

#include "network/ZORModel.h"
#include "network/expression_shape.h"

namespace zornet {

namespace {

constexpr int kRangeLength = 31;

RE2::Options Quiet() {
  RE2::Options options(RE2::Latin1);  // a byte is a character
  options.set_log_errors(false);
  return options;
}

}  // namespace

// The engine tells the faulty part, which at times is all of it.
Expression::Expression(const std::string& written) : mExpression(written, Quiet()) {
  if (mExpression.ok()) {
    Force();
    return;
  }
  const std::size_t at = written.find(mExpression.error_arg());
  throw ExpressionError(mExpression.error(), at == std::string::npos ? 0 : at);
}

// The engine knows two texts between which all that match lie.
void Expression::Force() {
  mForced = ShapeOfExpression(mExpression.pattern());
  std::string least, greatest;
  if (!mExpression.PossibleMatchRange(&least, &greatest, kRangeLength)) return;
  Shape range;
  range.least = ToZor(least);
  range.greatest = ToZor(greatest);
  mForced.Meet(range);
}

}  // namespace zornet
