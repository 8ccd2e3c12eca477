#pragma once

#include <string>
#include <string_view>

/// Unpacks one interval of a compiled help, written from the format alone and stricter than viewers are: it
/// throws std::runtime_error over codes that aren't complete, copies that reach over a frame or before the
/// interval, and padding that isn't zero.
std::string UnpackInterval(std::string_view bytes, std::size_t length);
