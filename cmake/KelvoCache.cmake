# SPDX-License-Identifier: Apache-2.0
# With IMS_CCACHE, what ccache still knows is not compiled again: after a clean, or a change that was
# taken back. A launcher that was named when configuring stays.
find_program(IMS_CCACHE_PROGRAM ccache)
mark_as_advanced(IMS_CCACHE_PROGRAM)
if(IMS_CCACHE AND IMS_CCACHE_PROGRAM
    AND NOT CMAKE_C_COMPILER_LAUNCHER AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
  # Precompiled headers hide from ccache which macros they use; nothing here uses the time.
  set(launcher ${CMAKE_COMMAND} -E env CCACHE_SLOPPINESS=pch_defines,time_macros
    ${IMS_CCACHE_PROGRAM})
  set(CMAKE_C_COMPILER_LAUNCHER ${launcher})
  set(CMAKE_CXX_COMPILER_LAUNCHER ${launcher})
  if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    add_compile_options($<$<COMPILE_LANGUAGE:CXX>:-fpch-preprocess>)
  endif()
endif()
