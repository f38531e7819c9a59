// Values rely on the texts that InitStrings sets. A debug build prints a message, once, if a value is made before that.
#pragma once

namespace zor {

#ifdef NDEBUG
inline void CheckReadiness() {}
#else
void CheckReadiness();
#endif

}  // namespace zor
