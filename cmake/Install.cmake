# What `cmake --install` lays down and CPack packs. The tree can be moved: libraries find each other by their place.
set(CMAKE_INSTALL_LIBDIR lib)  # zornet looks for its libraries in lib beside its own folder
set(CMAKE_INSTALL_DOCDIR share/doc/zorvadstrings)
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)
include(cmake/Interface.cmake)
set(header_dir ${CMAKE_INSTALL_INCLUDEDIR}/zorvadstrings)
set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/ZORVadStrings)

# A library for others, with its public headers. Before 1.0 every minor version may break the binary interface.
function(install_library name)
  set_target_properties(${name} PROPERTIES
    VERSION ${PROJECT_VERSION}
    SOVERSION ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR}
    INSTALL_RPATH "\$ORIGIN")
  target_compile_features(${name} PUBLIC cxx_std_20)
  export_interface(${name} host/ZORExport.h ${ARGN})
  target_sources(${name} PUBLIC FILE_SET HEADERS BASE_DIRS ${PROJECT_SOURCE_DIR} FILES ${ARGN})
  install(TARGETS ${name} EXPORT ZORVadStrings
    LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
    FILE_SET HEADERS DESTINATION ${header_dir}
    INCLUDES DESTINATION ${header_dir})
endfunction()

# What pkg-config tells of libraries: all that a program names when it links them.
function(install_pkg_config name description)
  list(TRANSFORM ARGN PREPEND -l)
  list(JOIN ARGN " " libraries)
  configure_file(cmake/pkg-config.pc.in ${name}.pc @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/${name}.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endfunction()

install_library(ZORHost
  host/ZORExport.h
  host/ZORNumbers.h
  host/ZORPrint.h
  host/ZORSolver.h
  host/ZORText.h)
install_library(ZORVadStrings
  enum/TextSet.h
  enum/ZORVadEnumString.h
  module/InitModule.h
  module/ZORStringClass.h
  module/ZORVaDoString.h
  module/texts.h
  single/ZORVadSingleString.h
  vector/ZORISVectorImp_String.h)
install_pkg_config(zorvadstrings "String types for a subdefinite constraint solver" ZORVadStrings ZORHost)

install_library(ZORNetwork
  network/ZORModel.h
  network/ZORNetwork.h)
install_pkg_config(zornetwork "Sound narrowing and search over networks of string constraints" ZORNetwork)

set_target_properties(zornet PROPERTIES INSTALL_RPATH "\$ORIGIN/../${CMAKE_INSTALL_LIBDIR}")
install(TARGETS zornet)
install(FILES zornet/zornet.1 DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 OPTIONAL)
install(FILES completions/zornet.bash DESTINATION share/bash-completion/completions RENAME zornet)
install(FILES completions/_zornet DESTINATION share/zsh/site-functions)
install(FILES completions/zornet.fish DESTINATION share/fish/vendor_completions.d)
install(DIRECTORY editors/vim/ DESTINATION share/vim/vimfiles)
install(FILES editors/zornet.tmLanguage.json DESTINATION share/zorvadstrings)
install(FILES README.md CONTRIBUTING.md CHANGELOG.md SECURITY.md LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR})
install(DIRECTORY docs DESTINATION ${CMAKE_INSTALL_DOCDIR}
  FILES_MATCHING PATTERN *.md PATTERN *.svg PATTERN *.cpp)
install(DIRECTORY examples DESTINATION ${CMAKE_INSTALL_DOCDIR} FILES_MATCHING PATTERN *.szn PATTERN *.txt)

install(EXPORT ZORVadStrings NAMESPACE ZORVadStrings:: FILE ZORVadStringsConfig.cmake DESTINATION ${package_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/ZORVadStringsConfigVersion.cmake
  COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/ZORVadStringsConfigVersion.cmake DESTINATION ${package_dir})

# gdb runs LIBRARY-gdb.py from beside a library whose folder the user trusts. In /usr it trusts a folder of its own.
set(printers libZORHost.so.${PROJECT_VERSION}-gdb.py)
install(CODE "
  set(folder ${CMAKE_INSTALL_LIBDIR})
  if(CMAKE_INSTALL_PREFIX MATCHES \"/usr/?$\")
    set(folder share/gdb/auto-load/usr/${CMAKE_INSTALL_LIBDIR})
  endif()
  file(INSTALL \"${PROJECT_SOURCE_DIR}/gdb/zorvadstrings.py\"
       DESTINATION \"\${CMAKE_INSTALL_PREFIX}/\${folder}\" RENAME ${printers})")

execute_process(COMMAND git log -1 --format=%ct WORKING_DIRECTORY ${PROJECT_SOURCE_DIR}
  OUTPUT_VARIABLE CPACK_SOURCE_TIME OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
set(CPACK_GENERATOR DEB TGZ)
set(CPACK_PACKAGE_NAME zorvadstrings)
set(ZOR_MAINTAINER "The ZORVadStrings authors <zorvadstrings@example.org>" CACHE STRING "Who answers for the packages")
set(CPACK_PACKAGE_CONTACT ${ZOR_MAINTAINER})
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "String value types for constraint solvers, and a program that uses them")
set(CPACK_PACKAGE_DESCRIPTION
"A variable of the solver holds what is still possible for it, at most one
text or a set of texts, and operations narrow that: equality, order, length,
case, concatenation and parts, each in both directions.
.
The program zornet narrows the variables of whole models, explains how it
came to a result and searches for solutions. The libraries behind it, their
headers and what CMake and pkg-config need are in this package too.")
set(CPACK_PROJECT_CONFIG_FILE ${PROJECT_SOURCE_DIR}/cmake/Packages.cmake)
set(CPACK_PRE_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/debian/Debian.cmake)
set(CPACK_POST_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/cmake/debian/Debian.cmake)
set(CPACK_DEBIAN_DEBUGINFO_PACKAGE ON)
set(CPACK_DEBIAN_PACKAGE_SECTION math)
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS graphviz)
set(CPACK_DEBIAN_PACKAGE_CONTROL_EXTRA ${PROJECT_SOURCE_DIR}/cmake/debian/triggers)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
include(CPack)
