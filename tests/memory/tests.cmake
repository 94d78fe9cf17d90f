# SPDX-License-Identifier: MIT
# The tests of the memory toolkit. scripts/test runs the scenarios on it.
qz_tests(memory qz::memory_driver)
