#include "network/texts.h"

namespace zornet {

const ZORString& GreatestText() {
  static const ZORString greatest(ZORChar('z'), kTextLimit);
  return greatest;
}

}  // namespace zornet
