# The installed package: find_package(bdmvnavigator) provides bdmvnavigator::bdmvnavigator and, if the
# port was built and its dependency is found, bdmvnavigator::kevro and bdmvnavigator::linux. Each
# component provides one more target.
#
# cmake --install BUILD --component NAME installs a part of it: Runtime, the shared library; DeskPlayer, the
# desk player's program; Development, everything else, which is what builds with the library need.
include(CMakePackageConfigHelpers)
include(cmake/PkgConfig.cmake)

set(CMAKE_INSTALL_DEFAULT_COMPONENT_NAME Development)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/bdmvnavigator)
set(header_dir ${CMAKE_INSTALL_INCLUDEDIR}/bdmvnavigator)

foreach(root inc bdmv/inc prv_inc)
  install(DIRECTORY ${root}/ DESTINATION ${header_dir} FILES_MATCHING PATTERN "*.h")
endforeach()
install(DIRECTORY bdmv/bdmvnavigator DESTINATION ${header_dir} FILES_MATCHING PATTERN "*.h")
install(FILES ${bdmvnavigator_generated_headers}/bdmvnavigator/version.h
  DESTINATION ${header_dir}/bdmvnavigator)

# An archive and a shared library can be installed in the same folder.
get_target_property(type bdmvnavigator TYPE)
if(type STREQUAL SHARED_LIBRARY)
  set(library_export bdmvnavigator-shared-targets)
else()
  set(library_export bdmvnavigator-targets)
endif()
install(TARGETS bdmvnavigator EXPORT ${library_export}
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
    COMPONENT Runtime
    NAMELINK_COMPONENT Development)
install(EXPORT ${library_export} NAMESPACE bdmvnavigator:: DESTINATION ${package_dir})
bdmvnavigator_install_module(bdmvnavigator bdmvnavigator "${PROJECT_DESCRIPTION}")

if(BDMVNAVIGATOR_BUILD_PORT)
  install(FILES ports/linux/kevro_linux.h DESTINATION ${header_dir})
  install(TARGETS kevro bdmvnavigator_linux EXPORT bdmvnavigator-kevro-targets
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR})
  install(EXPORT bdmvnavigator-kevro-targets NAMESPACE bdmvnavigator:: DESTINATION ${package_dir})
  bdmvnavigator_install_module(kevro bdmvnavigator-kevro
    "Platform interface of bdmvnavigator for Linux")
  bdmvnavigator_install_module(bdmvnavigator_linux bdmvnavigator-linux
    "bdmvnavigator with its platform interface for Linux")
endif()

# bdmvnavigator_install_component(NAME ROOT DESCRIPTION): a component of the package: its target and its
# headers, which are in the folder ROOT/NAME, except the private ones.
function(bdmvnavigator_install_component name root description)
  get_property(private_headers
    TARGET bdmvnavigator_${name} PROPERTY bdmvnavigator_private_headers)
  set(excluded)
  foreach(header IN LISTS private_headers)
    list(APPEND excluded PATTERN ${header} EXCLUDE)
  endforeach()
  install(DIRECTORY ${root}/${name} DESTINATION ${header_dir}
    FILES_MATCHING PATTERN "*.h" ${excluded})
  install(TARGETS bdmvnavigator_${name} EXPORT bdmvnavigator-${name}-targets
    ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR})
  install(EXPORT bdmvnavigator-${name}-targets
    NAMESPACE bdmvnavigator:: DESTINATION ${package_dir})
  bdmvnavigator_install_module(bdmvnavigator_${name} bdmvnavigator-${name} ${description})
endfunction()

get_property(kits GLOBAL PROPERTY bdmvnavigator_kits)
foreach(kit IN LISTS kits)
  bdmvnavigator_install_component(${kit} kits "The ${kit} of bdmvnavigator")
endforeach()

if(BDMVNAVIGATOR_BUILD_DESKPLAYER)
  bdmvnavigator_install_component(deskplayer deskplayer/inc
    "Simulated navigator of bdmvnavigator that plays discs for tests")
  install(TARGETS bdmv-deskplayer RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT DeskPlayer)
  install(FILES deskplayer/bdmv-deskplayer.1
    DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 COMPONENT DeskPlayer)
  install(FILES deskplayer/completion/bdmv-deskplayer
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions COMPONENT DeskPlayer)
  # Only if scripts/page has built it; the program looks for it in ../share relative to itself.
  install(FILES page/dist/timeline.html
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bdmvnavigator COMPONENT DeskPlayer OPTIONAL)
endif()

configure_package_config_file(cmake/bdmvnavigator-config.cmake.in
  ${PROJECT_BINARY_DIR}/bdmvnavigator-config.cmake
  INSTALL_DESTINATION ${package_dir})
# Before version 1 a minor version may change the interface.
if(PROJECT_VERSION_MAJOR EQUAL 0)
  set(compatibility SameMinorVersion)
else()
  set(compatibility SameMajorVersion)
endif()
write_basic_package_version_file(${PROJECT_BINARY_DIR}/bdmvnavigator-config-version.cmake
  COMPATIBILITY ${compatibility})
install(FILES
  ${PROJECT_BINARY_DIR}/bdmvnavigator-config.cmake
  ${PROJECT_BINARY_DIR}/bdmvnavigator-config-version.cmake
  DESTINATION ${package_dir})
