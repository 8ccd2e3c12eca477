#pragma once

#include <functional>
#include <string>

namespace tovimar {

/// Asks for one line of text; an empty answer cancels. In unattended mode, and in a program that can't ask,
/// nobody answers.
std::string InputBox(const std::string& prompt, const std::string& title, const std::string& defaultText,
                     const std::string& source);

/// What asks. Set by a program that can; an empty function takes it away.
using InputBoxShower = std::function<std::string(const std::string& prompt, const std::string& title,
                                                 const std::string& defaultText)>;
void SetInputBox(InputBoxShower shower);

} // namespace tovimar
