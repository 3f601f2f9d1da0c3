# Debian packages by CPack, one for each component of the installation. Their files are those of two builds:
# of this one and, with the shared library, of BDMVNAVIGATOR_SHARED_BUILD.
#
# No licence has been chosen yet, so the packages contain no copyright file, which lintian reports.
set(CPACK_GENERATOR DEB)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_ALL Runtime Development DeskPlayer)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_INSTALL_CMAKE_PROJECTS
  ${BDMVNAVIGATOR_SHARED_BUILD} ${PROJECT_NAME} ALL /
  ${PROJECT_BINARY_DIR} ${PROJECT_NAME} ALL /)
set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/documents.cmake)
set(CPACK_POST_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/control.cmake)
set(CPACK_STRIP_FILES ON)

set(CPACK_PACKAGE_CONTACT "The bdmvnavigator engineers <bdmvnavigator@example.invalid>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "") # each package begins its description with one
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_SOURCE ${PROJECT_NAME})
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(version ${PROJECT_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})

# The name of the package changes with the name of the library that programs load.
set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME libbdmvnavigator${PROJECT_VERSION_MAJOR})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SHLIBDEPS ON)
# What links the library depends on exactly this version: before version 1 another minor version may have
# another interface in a library of the same name.
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY "=")
set(CPACK_DEBIAN_RUNTIME_DESCRIPTION
"event layer of a Blu-ray Disc navigator - shared library
The part of a disc player's media middleware that notifies all other
components of what playback is doing. The navigator creates an event when
something observable happens; the library writes its log line and calls the
matching callback on every registered listener.
.
This package contains the shared library. A program that loads it defines
the platform interface, for example with the port in libbdmvnavigator-dev.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libbdmvnavigator-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
# The port writes its log through spdlog. Only the matchers of the test kit need GoogleMock.
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
  "${CPACK_DEBIAN_RUNTIME_PACKAGE_NAME} (= ${version}), libspdlog-dev")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SUGGESTS "bdmv-deskplayer, libgmock-dev")
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION
"event layer of a Blu-ray Disc navigator - development files
The part of a disc player's media middleware that notifies all other
components of what playback is doing. The navigator creates an event when
something observable happens; the library writes its log line and calls the
matching callback on every registered listener.
.
This package contains the headers, the library as an archive, the port to
Linux, the kits for navigators, clients and their tests, the desk player as
a library, the CMake package and the modules for pkg-config.")

set(CPACK_DEBIAN_DESKPLAYER_PACKAGE_NAME bdmv-deskplayer)
set(CPACK_DEBIAN_DESKPLAYER_PACKAGE_SECTION video)
set(CPACK_DEBIAN_DESKPLAYER_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_DESKPLAYER_DESCRIPTION
"print the callbacks that a Blu-ray Disc would trigger
Reads the metadata of a disc, plays it on a virtual clock or in real time,
and writes the callbacks that listeners of bdmvnavigator receive: as text,
as JSON lines, for trace viewers, or as a page for a browser. Sessions are
scripted and exactly repeatable; they can state what they expect.
.
It also checks and describes discs, and reads callbacks back from log files
and recordings. It plays neither video nor audio.")

include(CPack)
