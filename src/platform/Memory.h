#pragma once

namespace tovimar::platform {

/// Keeps freed memory in the process, for programs that take many pictures: these are megabytes that come and
/// go with each object, and memory that goes back to the system in between comes back page by page and
/// zeroed, which costs more than painting. Once, at program start.
void KeepFreedMemory();

} // namespace tovimar::platform
