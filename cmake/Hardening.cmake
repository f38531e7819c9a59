# Protections of optimised builds: stacks and sized copies are checked, jumps land where they may, code lies at random
# places, and the tables of addresses are read-only once a program has started.
if(NOT ZOR_HARDENING OR ZOR_SANITIZE OR CMAKE_BUILD_TYPE STREQUAL "Debug")
  return()
endif()
include(CheckCXXCompilerFlag)
include(CheckPIESupported)
check_pie_supported(LANGUAGES CXX)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
add_compile_options(-fstack-protector-strong -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2)
check_cxx_compiler_flag(-fcf-protection ZOR_CF_PROTECTION)  # on x86
if(ZOR_CF_PROTECTION)
  add_compile_options(-fcf-protection)
endif()
add_link_options(-Wl,-z,relro,-z,now)
