# The SPDX document of the installation: what is installed, every dependency with its version, and how they
# are related. The dependencies are those that the installed targets link, and the runtime of the
# compiler; the page has a document of its own, which its build writes.
#
# What takes time is done when the document is installed, by CompleteSbom.cmake.

# bdmvnavigator_sbom_id(VARIABLE NAME): the identifier of a package in the document.
function(bdmvnavigator_sbom_id variable name)
  string(REGEX REPLACE "[^A-Za-z0-9.]+" "-" id "SPDXRef-${name}")
  set(${variable} ${id} PARENT_SCOPE)
endfunction()

# bdmvnavigator_sbom_package(NAME VERSION PURPOSE [INSTALLED_AS FILE] [FOUND_AS FILE] [COMMENT TEXT]): adds
# a package, once. A file of a dependency leads to its Debian package.
function(bdmvnavigator_sbom_package name version purpose)
  cmake_parse_arguments(arg "" "INSTALLED_AS;FOUND_AS;COMMENT" "" ${ARGN})
  bdmvnavigator_sbom_id(id ${name})
  get_property(known GLOBAL PROPERTY bdmvnavigator_sbom_ids)
  if(id IN_LIST known)
    return()
  endif()
  set_property(GLOBAL APPEND PROPERTY bdmvnavigator_sbom_ids ${id})

  set(optional "")
  if(arg_INSTALLED_AS)
    string(APPEND optional "\n      \"packageFileName\": \"${arg_INSTALLED_AS}\",")
  endif()
  if(arg_COMMENT)
    string(APPEND optional "\n      \"comment\": \"${arg_COMMENT}\",")
  endif()
  if(IS_ABSOLUTE "${arg_FOUND_AS}")
    string(APPEND optional "\n      @package of ${arg_FOUND_AS}@")
  endif()
  get_property(present GLOBAL PROPERTY bdmvnavigator_sbom_packages)
  if(present)
    set_property(GLOBAL APPEND_STRING PROPERTY bdmvnavigator_sbom_packages ",\n")
  endif()
  set_property(GLOBAL APPEND_STRING PROPERTY bdmvnavigator_sbom_packages "    {
      \"SPDXID\": \"${id}\",
      \"name\": \"${name}\",
      \"versionInfo\": \"${version}\",
      \"primaryPackagePurpose\": \"${purpose}\",${optional}
      \"supplier\": \"NOASSERTION\",
      \"downloadLocation\": \"NOASSERTION\",
      \"filesAnalyzed\": false,
      \"licenseConcluded\": \"NOASSERTION\",
      \"licenseDeclared\": \"NOASSERTION\",
      \"copyrightText\": \"NOASSERTION\"
    }")
endfunction()

# bdmvnavigator_sbom_relate(NAME RELATIONSHIP NAME): adds a relationship, once.
function(bdmvnavigator_sbom_relate from relationship to)
  bdmvnavigator_sbom_id(from ${from})
  bdmvnavigator_sbom_id(to ${to})
  get_property(known GLOBAL PROPERTY bdmvnavigator_sbom_related)
  if("${from} ${relationship} ${to}" IN_LIST known)
    return()
  endif()
  set_property(GLOBAL APPEND PROPERTY bdmvnavigator_sbom_related "${from} ${relationship} ${to}")
  if(known)
    set_property(GLOBAL APPEND_STRING PROPERTY bdmvnavigator_sbom_relationships ",\n")
  endif()
  set_property(GLOBAL APPEND_STRING PROPERTY bdmvnavigator_sbom_relationships "    {
      \"spdxElementId\": \"${from}\",
      \"relationshipType\": \"${relationship}\",
      \"relatedSpdxElement\": \"${to}\"
    }")
endfunction()

# bdmvnavigator_sbom_runtime(): adds the libraries that the compiler links unasked.
# bdmvnavigator_sbom_runtime_names is the list of their names.
function(bdmvnavigator_sbom_runtime)
  set(probe ${PROJECT_BINARY_DIR}/sbom/runtime.cpp)
  file(WRITE ${probe} "#include <cstdlib>
glibc __GLIBC__.__GLIBC_MINOR__
libstdcxx _GLIBCXX_RELEASE
libcxx _LIBCPP_VERSION
")
  separate_arguments(flags UNIX_COMMAND "${CMAKE_CXX_COMPILER_ARG1} ${CMAKE_CXX_FLAGS}")
  set(compiler ${CMAKE_CXX_COMPILER} ${flags})
  if(CMAKE_SYSROOT)
    list(APPEND compiler --sysroot=${CMAKE_SYSROOT})
  endif()
  execute_process(COMMAND ${compiler} -E -P ${probe} OUTPUT_VARIABLE macros ERROR_QUIET)

  set(names)
  # The C library, the C++ library, and the functions that compiled code calls.
  if(macros MATCHES "glibc ([0-9]+)[ .]+([0-9]+)")
    list(APPEND names glibc)
    set(glibc_version ${CMAKE_MATCH_1}.${CMAKE_MATCH_2})
    set(glibc_file libc.so.6)
  endif()
  if(macros MATCHES "libstdcxx ([0-9]+)")
    list(APPEND names libstdc++ libgcc)
    set(libstdc++_version ${CMAKE_MATCH_1})
    # Both belong to g++, of which another compiler only knows the major version.
    if(CMAKE_CXX_COMPILER_ID STREQUAL GNU)
      set(libstdc++_version ${CMAKE_CXX_COMPILER_VERSION})
    endif()
    set(libgcc_version ${libstdc++_version})
    set(libstdc++_file libstdc++.so.6)
    set(libgcc_file libgcc_s.so.1)
  elseif(macros MATCHES "libcxx ([0-9]+)")
    list(APPEND names libc++)
    set(libc++_version ${CMAKE_MATCH_1})
    set(libc++_file libc++.so.1)
  endif()
  foreach(name IN LISTS names)
    execute_process(COMMAND ${compiler} -print-file-name=${${name}_file}
      OUTPUT_VARIABLE file OUTPUT_STRIP_TRAILING_WHITESPACE)
    bdmvnavigator_sbom_package(${name} ${${name}_version} LIBRARY FOUND_AS ${file})
  endforeach()
  set(bdmvnavigator_sbom_runtime_names ${names} PARENT_SCOPE)
  set(bdmvnavigator_sbom_gcc_version ${libgcc_version} PARENT_SCOPE)
endfunction()

# bdmvnavigator_sbom_requirements(VARIABLE LIBRARY): the imported targets that a dependency links.
function(bdmvnavigator_sbom_requirements variable library)
  set(requirements "")
  if(library MATCHES "^([A-Za-z0-9_]+)::")
    find_package(${CMAKE_MATCH_1} QUIET) # it was found for another folder, so not for this one
    get_target_property(requirements ${library} INTERFACE_LINK_LIBRARIES)
    list(FILTER requirements INCLUDE REGEX "^[A-Za-z0-9_]+::")
    list(REMOVE_ITEM requirements Threads::Threads) # part of the C library
  endif()
  set(${variable} "${requirements}" PARENT_SCOPE)
endfunction()

# bdmvnavigator_sbom_dependency(NAME_VARIABLE TYPE_VARIABLE LIBRARY): adds a library that a target links,
# and what it links itself. LIBRARY is an imported target, PACKAGE::NAME, or the name of a library such as
# atomic, which is part of g++. Its type is that of a target.
function(bdmvnavigator_sbom_dependency name_variable type_variable library)
  if(library MATCHES "^([A-Za-z0-9_]+)::")
    set(name ${CMAKE_MATCH_1})
    find_package(${name} QUIET)
    set(version "${${name}_VERSION}")
    get_target_property(type ${library} TYPE)
    set(file "${${name}_CONFIG}")
    if(NOT type STREQUAL INTERFACE_LIBRARY)
      get_target_property(file ${library} LOCATION)
    endif()
  else()
    set(name lib${library})
    set(version)
    if(library STREQUAL atomic)
      set(version "${bdmvnavigator_sbom_gcc_version}")
    endif()
    set(type SHARED_LIBRARY)
    execute_process(COMMAND ${CMAKE_CXX_COMPILER} -print-file-name=lib${library}.so
      OUTPUT_VARIABLE file OUTPUT_STRIP_TRAILING_WHITESPACE)
  endif()
  if(NOT version)
    set(version NOASSERTION)
  endif()
  bdmvnavigator_sbom_package(${name} ${version} LIBRARY FOUND_AS "${file}")
  bdmvnavigator_sbom_requirements(required ${library})
  foreach(item IN LISTS required)
    bdmvnavigator_sbom_dependency(item_name item_type ${item})
    bdmvnavigator_sbom_relate(${name} DEPENDS_ON ${item_name})
  endforeach()
  set(${name_variable} ${name} PARENT_SCOPE)
  set(${type_variable} ${type} PARENT_SCOPE)
endfunction()

# bdmvnavigator_sbom_target_name(VARIABLE TARGET): its name for those who use the installation.
function(bdmvnavigator_sbom_target_name variable target)
  get_target_property(type ${target} TYPE)
  get_target_property(exported ${target} EXPORT_NAME)
  if(type STREQUAL EXECUTABLE)
    set(${variable} ${target} PARENT_SCOPE)
  elseif(exported)
    set(${variable} bdmvnavigator::${exported} PARENT_SCOPE)
  else()
    set(${variable} bdmvnavigator::${target} PARENT_SCOPE)
  endif()
endfunction()

# bdmvnavigator_sbom_links(OWN_VARIABLE OTHER_VARIABLE TARGET ALL): what the target links: targets of this
# project, and others; if ALL, also what these link.
function(bdmvnavigator_sbom_links own_variable other_variable target all)
  set(own "")
  set(other "")
  set(queue ${target})
  while(queue)
    list(GET queue 0 current)
    list(REMOVE_AT queue 0)
    get_target_property(type ${current} TYPE)
    if(type STREQUAL INTERFACE_LIBRARY)
      get_target_property(libraries ${current} INTERFACE_LINK_LIBRARIES)
    else()
      get_target_property(libraries ${current} LINK_LIBRARIES)
    endif()
    foreach(library IN LISTS libraries)
      string(REGEX REPLACE "^\\$<BUILD_INTERFACE:(.*)>$" "\\1" library ${library})
      if(library MATCHES "\\$<")
        message(FATAL_ERROR "cmake/Sbom.cmake cannot interpret ${library}, which ${current} links")
      elseif(library MATCHES "^bdmvnavigator(::|_|$)")
        get_target_property(aliased ${library} ALIASED_TARGET)
        if(aliased)
          set(library ${aliased})
        endif()
        if(library MATCHES "_internals$") # not installed, so it counts as what it links
          list(APPEND queue ${library})
        elseif(NOT library IN_LIST own)
          list(APPEND own ${library})
          if(all)
            list(APPEND queue ${library})
          endif()
        endif()
      elseif(NOT library STREQUAL Threads::Threads) # part of the C library
        list(APPEND other ${library})
      endif()
    endforeach()
  endwhile()
  list(REMOVE_DUPLICATES other)
  # A linker may need what a dependency links for functions in the dependency's headers.
  set(queue)
  if(all)
    set(queue ${other})
  endif()
  while(queue)
    list(GET queue 0 current)
    list(REMOVE_AT queue 0)
    bdmvnavigator_sbom_requirements(required ${current})
    list(REMOVE_ITEM required ${other})
    list(APPEND other ${required})
    list(APPEND queue ${required})
  endwhile()
  set(${own_variable} ${own} PARENT_SCOPE)
  set(${other_variable} ${other} PARENT_SCOPE)
endfunction()

# bdmvnavigator_sbom_target(TARGET): adds an installed target, and what it needs. A program or shared
# library contains what it links as an archive; an archive only needs it. Either contains the code of
# libraries that consist of headers.
function(bdmvnavigator_sbom_target target)
  bdmvnavigator_sbom_target_name(name ${target})
  get_target_property(type ${target} TYPE)
  set(purpose LIBRARY)
  set(file)
  set(linked OFF)
  if(type STREQUAL EXECUTABLE)
    set(purpose APPLICATION)
  endif()
  if(NOT type STREQUAL INTERFACE_LIBRARY)
    set(file INSTALLED_AS $<TARGET_FILE_NAME:${target}>)
  endif()
  if(type MATCHES "^(EXECUTABLE|SHARED_LIBRARY)$")
    set(linked ON)
  endif()
  bdmvnavigator_sbom_package(${name} ${PROJECT_VERSION} ${purpose} ${file})
  bdmvnavigator_sbom_relate(bdmvnavigator CONTAINS ${name})

  set(relationship_if_static DEPENDS_ON)
  set(relationship_if_shared DEPENDS_ON)
  if(linked)
    set(relationship_if_static STATIC_LINK)
    set(relationship_if_shared DYNAMIC_LINK)
  endif()
  bdmvnavigator_sbom_links(own other ${target} ${linked})
  foreach(library IN LISTS own)
    bdmvnavigator_sbom_target_name(library_name ${library})
    get_target_property(library_type ${library} TYPE)
    set(relationship ${relationship_if_static})
    if(library_type STREQUAL INTERFACE_LIBRARY)
      set(relationship DEPENDS_ON)
    elseif(library_type STREQUAL SHARED_LIBRARY)
      set(relationship ${relationship_if_shared})
    endif()
    bdmvnavigator_sbom_relate(${name} ${relationship} ${library_name})
  endforeach()
  foreach(library IN LISTS other)
    bdmvnavigator_sbom_dependency(library_name library_type ${library})
    set(relationship ${relationship_if_static})
    if(library_type STREQUAL INTERFACE_LIBRARY)
      set(relationship STATIC_LINK)
    elseif(library_type STREQUAL SHARED_LIBRARY)
      set(relationship ${relationship_if_shared})
    endif()
    bdmvnavigator_sbom_relate(${name} ${relationship} ${library_name})
  endforeach()
  if(NOT type STREQUAL INTERFACE_LIBRARY)
    foreach(library IN LISTS bdmvnavigator_sbom_runtime_names)
      bdmvnavigator_sbom_relate(${name} ${relationship_if_shared} ${library})
    endforeach()
  endif()
endfunction()

# The installed targets.
set(bdmvnavigator_sbom_targets bdmvnavigator)
if(BDMVNAVIGATOR_BUILD_PORT)
  list(APPEND bdmvnavigator_sbom_targets kevro bdmvnavigator_linux)
endif()
get_property(kits GLOBAL PROPERTY bdmvnavigator_kits)
foreach(kit IN LISTS kits)
  list(APPEND bdmvnavigator_sbom_targets bdmvnavigator_${kit})
endforeach()
if(BDMVNAVIGATOR_BUILD_DESKPLAYER)
  list(APPEND bdmvnavigator_sbom_targets bdmvnavigator_deskplayer bdmv-deskplayer)
endif()

bdmvnavigator_sbom_package(bdmvnavigator ${PROJECT_VERSION} LIBRARY
  COMMENT "If the page of the desk player is installed, timeline.spdx.json describes it.")
bdmvnavigator_sbom_relate(DOCUMENT DESCRIBES bdmvnavigator)
bdmvnavigator_sbom_runtime()
foreach(target IN LISTS bdmvnavigator_sbom_targets)
  bdmvnavigator_sbom_target(${target})
endforeach()
set(compiler ${CMAKE_CXX_COMPILER_ID})
if(compiler STREQUAL GNU)
  set(compiler g++)
endif()
bdmvnavigator_sbom_package(${compiler} ${CMAKE_CXX_COMPILER_VERSION} APPLICATION
  FOUND_AS ${CMAKE_CXX_COMPILER})
bdmvnavigator_sbom_relate(${compiler} BUILD_TOOL_OF bdmvnavigator)
bdmvnavigator_sbom_package(CMake ${CMAKE_VERSION} APPLICATION FOUND_AS ${CMAKE_COMMAND})
bdmvnavigator_sbom_relate(CMake BUILD_TOOL_OF bdmvnavigator)

set(sbom bdmvnavigator-${PROJECT_VERSION}.spdx.json)
get_property(packages GLOBAL PROPERTY bdmvnavigator_sbom_packages)
get_property(relationships GLOBAL PROPERTY bdmvnavigator_sbom_relationships)
file(GENERATE OUTPUT ${PROJECT_BINARY_DIR}/sbom/${sbom}.in CONTENT "{
  \"spdxVersion\": \"SPDX-2.3\",
  \"dataLicense\": \"CC0-1.0\",
  \"SPDXID\": \"SPDXRef-DOCUMENT\",
  \"name\": \"bdmvnavigator-${PROJECT_VERSION}\",
  \"documentNamespace\": \"https://spdx.org/spdxdocs/bdmvnavigator-${PROJECT_VERSION}-@uuid@\",
  \"creationInfo\": {
    \"created\": \"@created@\",
    \"creators\": [\"Tool: CMake-${CMAKE_VERSION}\"]
  },
  \"packages\": [
${packages}
  ],
  \"relationships\": [
${relationships}
  ]
}
")
install(CODE "
  set(source \"${PROJECT_SOURCE_DIR}\")
  set(document \"${PROJECT_BINARY_DIR}/sbom/${sbom}\")")
install(SCRIPT cmake/CompleteSbom.cmake)
install(FILES ${PROJECT_BINARY_DIR}/sbom/${sbom} DESTINATION ${CMAKE_INSTALL_DATADIR}/bdmvnavigator)
if(BDMVNAVIGATOR_BUILD_DESKPLAYER)
  # Belongs to the page, which is installed if scripts/page has built it.
  install(FILES page/dist/timeline.spdx.json
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bdmvnavigator COMPONENT DeskPlayer OPTIONAL)
endif()
