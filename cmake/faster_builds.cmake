# SPDX-License-Identifier: MIT
# Uses a compiler cache and a fast linker if they are installed. Both are optional.
include(CheckLinkerFlag)

if(NOT DEFINED CMAKE_CXX_COMPILER_LAUNCHER)
  find_program(QZ_CCACHE ccache)
  if(QZ_CCACHE)
    set(CMAKE_CXX_COMPILER_LAUNCHER ${QZ_CCACHE})
  endif()
endif()

foreach(linker mold lld)  # the faster one first
  check_linker_flag(CXX -fuse-ld=${linker} QZ_LINKS_WITH_${linker})
  if(QZ_LINKS_WITH_${linker})
    add_link_options(-fuse-ld=${linker})
    break()
  endif()
endforeach()
