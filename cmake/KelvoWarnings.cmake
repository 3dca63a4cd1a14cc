# SPDX-License-Identifier: Apache-2.0
# Warnings and sanitizers for everything that is built here.
add_compile_options(
  -Wall -Wextra -Wpedantic -Wshadow -Wformat=2 -Wundef
  $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor>
  $<$<COMPILE_LANGUAGE:CXX>:-Woverloaded-virtual>)
if(IMS_WERROR)
  add_compile_options(-Werror)
endif()
if(IMS_SANITIZE)
  add_compile_options(-fsanitize=${IMS_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_link_options(-fsanitize=${IMS_SANITIZE})
  # Clang's checks of C++ code, which C programs get from the library they link.
  add_link_options("$<$<LINK_LANG_AND_ID:C,Clang>:-fsanitize-link-c++-runtime;-lstdc++>")
endif()
