find_package(Qt5 5.15 REQUIRED COMPONENTS Core)
find_package(XercesC REQUIRED)
find_package(Boost 1.74 REQUIRED)
find_package(TCL REQUIRED)
find_package(CLI11 REQUIRED)
find_package(Threads REQUIRED)

# FindTCL gives variables only; one target keeps the users of the interpreter in step.
add_library(orx_tcl INTERFACE)
target_include_directories(orx_tcl SYSTEM INTERFACE ${TCL_INCLUDE_PATH})
target_link_libraries(orx_tcl INTERFACE ${TCL_LIBRARY})

if(ORX_BUILD_TESTS)
  find_package(GTest REQUIRED)
endif()
if(ORX_BUILD_BENCH)
  find_package(benchmark REQUIRED)
endif()
