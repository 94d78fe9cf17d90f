// Letters of ASCII without regard to case. The locale has no say.
#pragma once

namespace toolkit {

constexpr char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

}  // namespace toolkit
