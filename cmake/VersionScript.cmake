# Writes the linker's version script from the list of exports:
#   cmake -DLIST=exports.def -DOUTPUT=pyxcc.map -P VersionScript.cmake
file(STRINGS "${LIST}" rows REGEX "^EXPORT\\(")
set(names "        pyxccGetLibVersion;\n")
foreach(row IN LISTS rows)
  string(REGEX MATCH "pyxi[A-Za-z0-9_]+" name "${row}")
  string(APPEND names "        ${name};\n")
endforeach()
file(WRITE "${OUTPUT}" "{\n    global:\n${names}    local:\n        *;\n};\n")
