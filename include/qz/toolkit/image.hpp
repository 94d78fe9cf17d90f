// SPDX-License-Identifier: MIT
// Images and their lookup by name.
#pragma once

#include <string>
#include <string_view>

#include "qz/api.hpp"
#include "qz/toolkit/ref.hpp"

namespace qz::toolkit {

/// An image. Only the toolkit that made it can draw it.
class QZ_API Image {
 public:
  virtual ~Image() = default;
  /// Returns the object behind absent references: it answers zero, NO or absent, and changes do
  /// nothing.
  static Image& nothing();

  /// The name under which the image was found.
  virtual std::string name() const = 0;
};

/// Finds images by name.
class QZ_API Images {
 public:
  virtual ~Images() = default;

  /// Returns the image named `name`: a resource name, with or without the suffix of an image
  /// format, not a path. Absent if there is no such image in the resources.
  virtual Ref<Image> imageNamed(std::string_view name) = 0;
};

}  // namespace qz::toolkit
