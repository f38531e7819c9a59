# CPack reads this for each kind of package: the .deb has its debug symbols in a package beside it, the archive has none.
if(CPACK_GENERATOR STREQUAL "TGZ")
  set(CPACK_STRIP_FILES ON)
endif()
# Packages bear the time of what they were made from, not that of making them.
if(NOT DEFINED ENV{SOURCE_DATE_EPOCH} AND CPACK_SOURCE_TIME)
  set(ENV{SOURCE_DATE_EPOCH} ${CPACK_SOURCE_TIME})
endif()
