# SPDX-License-Identifier: MIT
# A compiler cache and a quick linker, where they are installed. Nothing needs them.
include(CheckLinkerFlag)

if(NOT DEFINED CMAKE_CXX_COMPILER_LAUNCHER)
  find_program(QZ_CCACHE ccache)
  if(QZ_CCACHE)
    set(CMAKE_CXX_COMPILER_LAUNCHER ${QZ_CCACHE})
  endif()
endif()

foreach(linker mold lld)  # the quicker first
  check_linker_flag(CXX -fuse-ld=${linker} QZ_LINKS_WITH_${linker})
  if(QZ_LINKS_WITH_${linker})
    add_link_options(-fuse-ld=${linker})
    break()
  endif()
endforeach()
