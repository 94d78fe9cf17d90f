# SPDX-License-Identifier: MIT
# Every build has the memory toolkit.
list(APPEND QZ_TOOLKITS memory)
