#pragma once

#include "platform/AutomationObject.h"

#include <cstdint>
#include <string>
#include <string_view>

/// Calls on the host's late-bound objects as its own language writes them. A null object raises 91 "Object
/// variable not set"; the host's own failures pass through.
namespace tovimar::late {

Value Get(const HostObject& object, std::string_view member,
          const AutomationObject::Arguments& arguments = {});
void Set(const HostObject& object, std::string_view member, const Value& value);
Value Call(const HostObject& object, std::string_view member,
           const AutomationObject::Arguments& arguments = {});

HostObject Object(const HostObject& object, std::string_view member,
                  const AutomationObject::Arguments& arguments = {});
std::string Text(const HostObject& object, std::string_view member,
                 const AutomationObject::Arguments& arguments = {});
std::int32_t Integer(const HostObject& object, std::string_view member,
                     const AutomationObject::Arguments& arguments = {});
double Number(const HostObject& object, std::string_view member);
bool Flag(const HostObject& object, std::string_view member);

/// `object.Properties(name).Value`.
Value Property(const HostObject& object, const std::string& name);

/// The same with failures answered by empty, 0 and null.
Value PropertyOrNull(const HostObject& object, const std::string& name);
std::int32_t IntegerOrZero(const HostObject& object, std::string_view member);
bool FlagOrFalse(const HostObject& object, std::string_view member);
std::string TextOrEmpty(const HostObject& object, std::string_view member);
HostObject ObjectOrNull(const HostObject& object, std::string_view member,
                        const AutomationObject::Arguments& arguments = {});

std::string ClassName(const HostObject& object);
bool Same(const HostObject& left, const HostObject& right);

/// Items of a collection, from 0 as the host counts them.
std::int32_t Count(const HostObject& collection);
HostObject Item(const HostObject& collection, const Value& indexOrName);

template <typename Visitor> void ForEach(const HostObject& collection, Visitor visit) {
    const std::int32_t count = Count(collection);
    for (std::int32_t i = 0; i < count; ++i)
        visit(Item(collection, i));
}

} // namespace tovimar::late
