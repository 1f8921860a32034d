# Linking of what is installed: pyxcc_hardening(<target>). All names are resolved at start and what holds them is then
# read-only, the stack holds no code, and programs can be loaded anywhere.
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)

function(pyxcc_hardening target)
  set_target_properties(${target} PROPERTIES POSITION_INDEPENDENT_CODE ON)
  target_link_options(${target} PRIVATE -Wl,-z,relro,-z,now,-z,noexecstack)
endfunction()
