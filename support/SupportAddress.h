#pragma once
// Where users send their reports.

#include <string>

namespace zel {

/// The support's mail box, as the build names it.
extern const std::string kSupportAddress;

/// A caption in which "&&" stands for one "&", and "&" before a letter for its key, as text.
std::string captionText(const std::string& caption);

}  // namespace zel
