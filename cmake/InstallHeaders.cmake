cmake_minimum_required(VERSION 3.25)

# Installs the public headers: every header that marks something with ORX_EXPORT, the umbrella header of each platform
# library, and what those include. All other headers are the library's own and stay out.
# In: ORX_SOURCE_DIR, ORX_INCLUDEDIR (below the prefix).

file(GLOB_RECURSE pending RELATIVE ${ORX_SOURCE_DIR}
  ${ORX_SOURCE_DIR}/platform/*.h ${ORX_SOURCE_DIR}/transform/*.h ${ORX_SOURCE_DIR}/translation/*.h)
foreach(header IN LISTS pending)
  file(READ ${ORX_SOURCE_DIR}/${header} text)
  get_filename_component(folder ${header} DIRECTORY)
  get_filename_component(name ${header} NAME_WE)
  if(NOT text MATCHES "ORX_EXPORT " AND NOT folder STREQUAL "platform/${name}")
    list(REMOVE_ITEM pending ${header})
  endif()
endforeach()

set(public)
while(pending)
  list(POP_FRONT pending header)
  if(header IN_LIST public)
    continue()
  endif()
  list(APPEND public ${header})
  file(STRINGS ${ORX_SOURCE_DIR}/${header} includes REGEX "^#include <(platform|transform|translation)/")
  list(TRANSFORM includes REPLACE "^#include <([^>]+)>.*" "\\1")
  list(APPEND pending ${includes})
endwhile()

list(SORT public)
foreach(header IN LISTS public)
  get_filename_component(folder ${header} DIRECTORY)
  file(INSTALL ${ORX_SOURCE_DIR}/${header} DESTINATION ${CMAKE_INSTALL_PREFIX}/${ORX_INCLUDEDIR}/${folder})
endforeach()
