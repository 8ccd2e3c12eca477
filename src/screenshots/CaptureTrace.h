#pragma once

#include "foundation/CTraceLog.h"
#include "foundation/Session.h"

#include <string>

/// Trace lines of captures. They are many, so they are only composed under verbose tracing.
namespace tovimar::capture_trace {

template <typename Compose> void Line(const Compose& compose) {
    if (Session::Context().VerboseTracing())
        Session::TraceLog()->addMessage(compose());
}

inline std::string Yes(bool value) {
    return value ? "True" : "False";
}

} // namespace tovimar::capture_trace
