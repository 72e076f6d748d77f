# Warnings, sanitizers and path hygiene shared by every target of the project.

add_compile_options(-Wall -Wextra)

# Source paths in __FILE__ are written relative to the top of the tree, so
# the file names in trace lines do not depend on where the tree was checked
# out or built.
add_compile_options("-fmacro-prefix-map=${CMAKE_SOURCE_DIR}/=")

add_link_options("LINKER:--enable-new-dtags")

if(TVR_SANITIZE)
  if(TVR_SANITIZE STREQUAL "thread")
    set(_tvr_san_flags -fsanitize=thread)
  else()
    set(_tvr_san_flags "-fsanitize=${TVR_SANITIZE}" -fno-sanitize-recover=all)
  endif()
  add_compile_options(${_tvr_san_flags} -fno-omit-frame-pointer)
  add_link_options(${_tvr_san_flags})
endif()
