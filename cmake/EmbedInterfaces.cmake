# SPDX-License-Identifier: Apache-2.0
# cmake -DOUTPUT=file.cpp -P EmbedInterfaces.cmake file.xml...: the interfaces that the files
# describe, as they stand there, in a table for C++.
cmake_minimum_required(VERSION 3.25)
set(rows)
math(EXPR last "${CMAKE_ARGC} - 1")
foreach(at RANGE ${last})
  set(file ${CMAKE_ARGV${at}})
  if(NOT file MATCHES "\\.xml$")
    continue()
  endif()
  file(READ ${file} text)
  if(NOT text MATCHES "<node>\n(.*)</node>")
    message(FATAL_ERROR "${file}: no <node> with an interface")
  endif()
  set(content "${CMAKE_MATCH_1}")
  if(NOT content MATCHES "<interface name=\"([^\"]+)\"")
    message(FATAL_ERROR "${file}: no interface")
  endif()
  string(APPEND rows "    {\"${CMAKE_MATCH_1}\",\n     R\"xml(${content})xml\"},\n")
endforeach()
file(WRITE ${OUTPUT} "// Made of dbus/interfaces.
#include \"sim/bus/introspection.hpp\"

namespace sim::introspection {

const Description kDescriptions[] = {
${rows}};

std::span<const Description> descriptions() {
    return kDescriptions;
}

} // namespace sim::introspection
")
