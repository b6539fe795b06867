cmake_minimum_required(VERSION 3.25)

# Installs the public headers: those of the platform libraries, and the faces of the floors. A floor's own folder is its
# face; the headers in its rooms are its own business, and scripts/check-floors sees to it that no face includes them.
# In: ORX_SOURCE_DIR, ORX_INCLUDEDIR (below the prefix).

file(GLOB faces RELATIVE ${ORX_SOURCE_DIR} ${ORX_SOURCE_DIR}/platform/*.h ${ORX_SOURCE_DIR}/platform/*/*.h
  ${ORX_SOURCE_DIR}/transform/*/*.h ${ORX_SOURCE_DIR}/translation/*.h)
foreach(header IN LISTS faces)
  get_filename_component(folder ${header} DIRECTORY)
  file(INSTALL ${ORX_SOURCE_DIR}/${header} DESTINATION ${CMAKE_INSTALL_PREFIX}/${ORX_INCLUDEDIR}/${folder})
endforeach()
