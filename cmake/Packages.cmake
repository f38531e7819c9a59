# CPack reads this for each kind of package: the .deb has its debug symbols in a package beside it, the archive has none.
if(CPACK_GENERATOR STREQUAL "TGZ")
  set(CPACK_STRIP_FILES ON)
endif()
