// SPDX-License-Identifier: MIT
// From JSON to the values that property lists hold, and back.
#pragma once

#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/value.hpp"
#include "tools/scenario/json.hpp"

namespace tools::scenario {

/// Numbers without a fraction become integers. Collections can be changed. JSON's null, which no
/// property list has, is no value.
toolkit::ValueRef<> toValue(const Json& json);
toolkit::ValueRef<toolkit::Dictionary> toDictionary(const Json& object);

/// What JSON lacks is written as an object of one key: {"date": seconds since 2001}, {"data":
/// "hexadecimal"}, {"uid": number}, {"set": [...]}, {"real": "nan"}. Keys that are no strings are
/// written as they are described.
Json toJson(const toolkit::ValueRef<>& value);

}  // namespace tools::scenario
