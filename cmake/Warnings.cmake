# Warnings for every target of the project: pyxcc_warnings(<target>).
function(pyxcc_warnings target)
  target_compile_options(${target} PRIVATE -Wall -Wextra -Wpedantic)
  if(PYXCC_WERROR)
    target_compile_options(${target} PRIVATE -Werror)
  endif()
endfunction()
