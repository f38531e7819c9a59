// Guesses what a misspelt word was meant to be.
#pragma once

#include <span>
#include <string>
#include <string_view>

namespace zornet {

// The closest word; empty when none is close enough to be meant.
std::string_view Closest(std::string_view word, std::span<const std::string_view> words);

// "; did you mean 'x'?", or nothing when there is no closest word.
std::string Suggestion(std::string_view closest);
std::string Suggestion(std::string_view word, std::span<const std::string_view> words);

}  // namespace zornet
