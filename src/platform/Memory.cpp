#include "platform/Memory.h"

#include <malloc.h>

namespace tovimar::platform {

void KeepFreedMemory() {
    constexpr int kLargestKept = 32 << 20, kMostKept = 256 << 20;
    mallopt(M_MMAP_THRESHOLD, kLargestKept);
    mallopt(M_TRIM_THRESHOLD, kMostKept);
}

} // namespace tovimar::platform
