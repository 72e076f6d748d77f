# Writes the manual page: runs `${TVRPA} --man` into ${OUTPUT}, and fails the
# build when the tool fails, rather than installing half a page.
execute_process(COMMAND ${TVRPA} --man
  OUTPUT_FILE ${OUTPUT}.new
  RESULT_VARIABLE status)
if(NOT status EQUAL 0)
  file(REMOVE ${OUTPUT}.new)
  message(FATAL_ERROR "${TVRPA} --man failed: ${status}")
endif()
file(RENAME ${OUTPUT}.new ${OUTPUT})
