# Every build checks the shipped definitions and the samples' mapping files with the command itself.
if(TARGET orxt)
  file(GLOB_RECURSE shipped CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/transformers/*
    ${PROJECT_SOURCE_DIR}/samples/*.mf ${PROJECT_SOURCE_DIR}/samples/*.ort)
  set(lint_stamp ${CMAKE_BINARY_DIR}/resources.linted)
  add_custom_command(OUTPUT ${lint_stamp}
    COMMAND ${CMAKE_COMMAND} -E env ORX_HOME=${PROJECT_SOURCE_DIR}/resources
      $<TARGET_FILE:orxt> lint --resources ${PROJECT_SOURCE_DIR}/samples/custom
      ${PROJECT_SOURCE_DIR}/resources/transformers ${PROJECT_SOURCE_DIR}/samples
    COMMAND ${CMAKE_COMMAND} -E touch ${lint_stamp}
    DEPENDS orxt ${shipped}
    COMMENT "Checking the shipped definitions and the samples" VERBATIM)
  add_custom_target(lint_resources ALL DEPENDS ${lint_stamp})
endif()
