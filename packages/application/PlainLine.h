#pragma once

#include <string>

/// The text as one line that a screen can show: what is no UTF-8 becomes U+FFFD, control characters become blanks, and
/// one that is longer than a screen is wide ends in "…".
std::string plainLine(const std::string& text);
