# Every build checks the shipped definitions with the command itself.
if(TARGET orxt AND EXISTS ${PROJECT_SOURCE_DIR}/apps/orxt/LintCommand.cpp)
  file(GLOB_RECURSE shipped CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/transformers/*)
  set(lint_stamp ${CMAKE_BINARY_DIR}/resources.linted)
  add_custom_command(OUTPUT ${lint_stamp}
    COMMAND ${CMAKE_COMMAND} -E env ORX_HOME=${PROJECT_SOURCE_DIR}/resources
      $<TARGET_FILE:orxt> lint ${PROJECT_SOURCE_DIR}/resources/transformers
    COMMAND ${CMAKE_COMMAND} -E touch ${lint_stamp}
    DEPENDS orxt ${shipped}
    COMMENT "Checking the shipped definitions" VERBATIM)
  add_custom_target(lint_resources ALL DEPENDS ${lint_stamp})
endif()
