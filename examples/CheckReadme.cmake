# Fails unless the README shows the example as it is:
#   cmake -DEXAMPLE=first.c -DREADME=README.md -P CheckReadme.cmake
file(READ "${EXAMPLE}" example)
file(READ "${README}" readme)
string(FIND "${readme}" "```c\n${example}```\n" at)
if(at EQUAL -1)
  message(FATAL_ERROR "${README} does not show ${EXAMPLE} as it is: copy it into the block marked with c")
endif()
