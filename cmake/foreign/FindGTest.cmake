# GoogleTest and GoogleMock, built from Debian's package of its sources.
include(FindPackageHandleStandardArgs)
find_path(GTest_SOURCES googletest/src/gtest-all.cc
  PATHS /usr/src/googletest NO_DEFAULT_PATH NO_CMAKE_FIND_ROOT_PATH)
find_package_handle_standard_args(GTest REQUIRED_VARS GTest_SOURCES)
if(GTest_FOUND AND NOT TARGET GTest::gtest)
  set(BUILD_GMOCK ON)
  set(INSTALL_GTEST OFF)
  add_subdirectory(${GTest_SOURCES} ${CMAKE_BINARY_DIR}/googletest EXCLUDE_FROM_ALL)
endif()
