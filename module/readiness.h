// Values rely on the texts that InitStrings sets. A debug build says so, once, when a value is made before that.
#pragma once

namespace zor {

#ifdef NDEBUG
inline void CheckReadiness() {}
#else
void CheckReadiness();
#endif

}  // namespace zor
