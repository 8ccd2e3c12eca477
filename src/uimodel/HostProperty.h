#pragma once

#include "platform/AutomationObject.h"

#include <cstdint>
#include <string>

/// Reads of host properties with failures switched off: a property that can't be read counts as absent.
namespace tovimar::HostProperty {

/// Null when it can't be read.
Value Read(const HostObject& object, const char* name, const AutomationObject::Arguments& arguments = {});
bool Readable(const HostObject& object, const char* name);
std::int32_t Integer(const HostObject& object, const char* name, std::int32_t absent = 0);
double Number(const HostObject& object, const char* name, double absent = 0);
bool Flag(const HostObject& object, const char* name);
std::string Text(const HostObject& object, const char* name);
HostObject Object(const HostObject& object, const char* name,
                  const AutomationObject::Arguments& arguments = {});

} // namespace tovimar::HostProperty
