#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>

namespace tovimar {

/// Result of an operation that reports by number: 0 is success, everything else a failure.
/// Failures with a text of their own start at 0x80040001.
using ResultCode = std::int32_t;

constexpr ResultCode MakeResultCode(std::uint32_t bits) {
    return static_cast<ResultCode>(bits);
}

constexpr ResultCode kSuccess = 0;
/// General failure of an operation, or a run that was stopped.
constexpr ResultCode kGeneralFailure = MakeResultCode(0x8003FE09U);
constexpr ResultCode kFailure1 = MakeResultCode(0x80040001U);
constexpr ResultCode kFailure2 = MakeResultCode(0x80040002U);
constexpr ResultCode kFailure3 = MakeResultCode(0x80040003U);

/// The one kind of raised failure: a number, a text for a person (`what()`) and the place that raised it.
class RaisedError : public std::runtime_error {
public:
    RaisedError(ResultCode number, const std::string& text, std::string source = {})
        : std::runtime_error(text), number_(number), source_(std::move(source)) {}

    ResultCode Number() const { return number_; }
    const std::string& Source() const { return source_; }

private:
    ResultCode number_;
    std::string source_;
};

} // namespace tovimar
