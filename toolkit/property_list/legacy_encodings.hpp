// SPDX-License-Identifier: MIT
// The encodings older than Unicode that an XML property list may declare.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace toolkit {

/// Appends as UTF-8 what `bytes` say in an encoding, and returns how many of them it understood:
/// all of them, or as many as stand before the first that mean nothing there.
using LegacyDecoder = std::size_t (*)(std::string_view encoding, std::string_view bytes,
                                      std::string& text);

// Names are compared without regard to case and punctuation.

bool isUtf8Name(std::string_view name);
/// What decodes the encoding of that name, as the IANA registers it or as it is commonly called;
/// null when none is known. The decoder is to be given the same name.
LegacyDecoder legacyDecoder(std::string_view name);

}  // namespace toolkit
