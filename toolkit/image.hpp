// SPDX-License-Identifier: MIT
// Images, and finding them by name.
#pragma once

#include <string>
#include <string_view>

#include "toolkit/ref.hpp"

namespace toolkit {

/// An image. Only the toolkit that made it knows what it looks like.
class Image {
 public:
  virtual ~Image() = default;
  static Image& nothing();

  /// The name under which it was found.
  virtual std::string name() const = 0;
};

class Images {
 public:
  virtual ~Images() = default;

  /// The image named `name`: a resource name, with or without the suffix of an image format, not a
  /// path. Absent when the resources hold no such image.
  virtual Ref<Image> imageNamed(std::string_view name) = 0;
};

}  // namespace toolkit
