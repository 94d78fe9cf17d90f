# SPDX-License-Identifier: MIT
# The tests of the AppKit toolkit.
