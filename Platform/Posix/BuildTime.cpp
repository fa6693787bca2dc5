#include "Platform/Posix/BuildTime.h"

namespace kelvasi {

const char* compiledAt() {
  return __DATE__ " " __TIME__;
}

}  // namespace kelvasi
