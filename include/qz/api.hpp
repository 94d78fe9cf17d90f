// SPDX-License-Identifier: MIT
// Marks what the shared libraries export: the public declarations, and nothing else.
#pragma once

#if defined(__ELF__) || defined(__MACH__)
#define QZ_API __attribute__((visibility("default")))
#else
#define QZ_API  // static libraries, which do not hide anything
#endif
