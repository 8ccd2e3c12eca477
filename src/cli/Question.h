#pragma once

#include <cstdint>
#include <string>

namespace tovimar::cli {

/// Somebody sits at the terminal: both standard input and standard error are one.
bool HasTerminal();
/// Asks a box's question there and gives the pressed button. The buttons stand behind it as words, the
/// default one, which Enter alone takes, in capitals; a word's beginning is enough. Raises `Stop` on Ctrl+C
/// and at the end of the input.
int AskOnTerminal(const std::string& text, std::uint32_t flags);
/// "yes", "no", "cancel", ... of a button.
std::string AnswerWord(int answer);

} // namespace tovimar::cli
