# Fails unless the README shows the example as it is, and counts the exports of each family as its header declares them:
#   cmake -DROOT=<project> -P CheckReadme.cmake
file(READ ${ROOT}/README.md readme)

file(READ ${ROOT}/examples/first.c example)
string(FIND "${readme}" "```c\n${example}```\n" at)
if(at EQUAL -1)
  message(SEND_ERROR "README.md does not show examples/first.c as it is")
endif()

file(GLOB headers RELATIVE ${ROOT} ${ROOT}/include/pyxcc/*.h)
foreach(header IN LISTS headers)
  file(STRINGS ${ROOT}/${header} declarations REGEX "^PYXCC_API PyxStatus PYXCC_CALL pyxi")
  list(LENGTH declarations count)
  get_filename_component(name ${header} NAME)
  string(FIND "${readme}" "| ${count} | [${name}](${header}) |\n" at)
  if(count GREATER 0 AND at EQUAL -1)
    message(SEND_ERROR "README.md has no row that tells of the ${count} exports of ${header}")
  endif()
endforeach()
