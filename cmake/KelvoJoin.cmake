# SPDX-License-Identifier: Apache-2.0
# ims_join_folders(target...): the sources that lie in one folder are compiled as one. What most of
# them cost is the heavy headers, read again for each; names of one file alone are therefore unique
# in its folder. A file that has definitions of its own stays apart. Without IMS_JOIN_FOLDERS each
# file is compiled by itself: that shows a missing include, and rebuilds less after a change.
function(ims_join_folders)
  if(NOT IMS_JOIN_FOLDERS)
    return()
  endif()
  foreach(target IN LISTS ARGN)
    set_target_properties(${target} PROPERTIES UNITY_BUILD ON UNITY_BUILD_MODE GROUP)
    get_target_property(sources ${target} SOURCES)
    foreach(source IN LISTS sources)
      if(IS_ABSOLUTE ${source} OR NOT source MATCHES "\\.cpp$")
        continue()
      endif()
      cmake_path(GET source PARENT_PATH folder)
      string(MAKE_C_IDENTIFIER "folder_${folder}" group)
      set_source_files_properties(${source} PROPERTIES UNITY_GROUP ${group})
    endforeach()
  endforeach()
endfunction()
