// SPDX-License-Identifier: MIT
// Converts JSON to property-list values, and back.
#pragma once

#include "qz/property_list/collections.hpp"
#include "qz/property_list/value.hpp"
#include "tools/scenario/json.hpp"

namespace qz::tools::scenario {

/// Numbers written without a fraction become integers. Collections are mutable. `json` must not
/// contain null, which property lists lack.
toolkit::ValueRef<> toValue(const Json& json);
toolkit::ValueRef<toolkit::Dictionary> toDictionary(const Json& object);

/// Kinds that JSON lacks become an object with one key: {"date": seconds since 2001}, {"data":
/// "hexadecimal"}, {"uid": number}, {"set": [...]}, {"real": "nan"}. Keys that are not strings
/// become their descriptions.
Json toJson(const toolkit::ValueRef<>& value);

}  // namespace qz::tools::scenario
