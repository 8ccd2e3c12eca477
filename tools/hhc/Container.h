#pragma once

#include <string>

/// What is set right in the bytes of a compiled help before it is handed out. All of it lies in places of
/// fixed size, so nothing moves.
namespace hhc {

/// - The directory names its first chunk; `chmcmd` names the second one, and readers that go through the
/// files
///   one after the other miss those of the first.
/// - The container's second identifier, which strict readers compare.
/// - The two time stamps become a number made of the contents: the same project gives the same bytes, and a
///   changed one another stamp, by which viewers know a file that is new.
/// Bytes that aren't such a container stay as they are; false then.
bool SetRight(std::string& container);

} // namespace hhc
