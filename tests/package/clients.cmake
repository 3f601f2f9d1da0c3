# Clients as README.md shows them: each row of clients.txt is a project with the lines of the README.
#
# For each kind of library, archive or shared: prefix_KIND is where it is installed, package_KIND the fixture
# that installs it, and options_KIND the options of CMake that select it where both are installed.
# build_options are those of all clients; instrumented is ON if the library was built with a sanitizer.
get_filename_component(sources ${CMAKE_CURRENT_LIST_DIR}/../.. ABSOLUTE)
set(clients ${CMAKE_CURRENT_LIST_DIR})
set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS
  ${sources}/README.md ${clients}/clients.txt)

# The blocks of code in the README's section about this.
file(READ ${sources}/README.md readme)
if(NOT readme MATCHES "\n## Add it to a project\n(([^#]|#[^#])*)\n## ")
  message(FATAL_ERROR "the README has no section 'Add it to a project'")
endif()
string(REGEX MATCHALL "```[a-z]+\n[^`]+```" blocks "${CMAKE_MATCH_1}")

# bdmvnavigator_documented(VARIABLE PATTERN): the lines of the only block that matches PATTERN.
function(bdmvnavigator_documented variable pattern)
  set(found ${blocks})
  list(FILTER found INCLUDE REGEX ${pattern})
  list(LENGTH found count)
  if(NOT count EQUAL 1)
    message(FATAL_ERROR "the README has ${count} blocks with ${pattern}, expected 1")
  endif()
  string(REGEX REPLACE "^```[a-z]+\n|```$" "" found "${found}")
  set(${variable} "${found}" PARENT_SCOPE)
endfunction()

bdmvnavigator_documented(lines_installed "find_package[^`]*::linux")
bdmvnavigator_documented(lines_subproject "add_subdirectory")
bdmvnavigator_documented(lines_FetchContent "FetchContent")
bdmvnavigator_documented(lines_pkg-config "pkg-config")

# bdmvnavigator_client_compiler(NAME VARIABLE): the path of a compiler, or "" and the reason in
# VARIABLE_missing. Only this build's own compiler can link what is instrumented or for another machine.
if(CMAKE_CXX_COMPILER_ID MATCHES Clang)
  set(this_compiler clang++)
else()
  set(this_compiler g++)
endif()
function(bdmvnavigator_client_compiler name variable)
  set(path)
  set(missing)
  if(name STREQUAL this OR name STREQUAL this_compiler)
    set(path ${CMAKE_CXX_COMPILER})
  elseif(CMAKE_CROSSCOMPILING)
    set(missing "there is no ${name} for ${CMAKE_SYSTEM_PROCESSOR}")
  elseif(instrumented)
    set(missing "the library is instrumented for ${this_compiler}")
  else()
    find_program(BDMVNAVIGATOR_CLIENT_${name} ${name})
    if(BDMVNAVIGATOR_CLIENT_${name})
      set(path ${BDMVNAVIGATOR_CLIENT_${name}})
    else()
      set(missing "${name} is not installed")
    endif()
  endif()
  set(${variable} "${path}" PARENT_SCOPE)
  set(${variable}_missing "${missing}" PARENT_SCOPE)
endfunction()

# bdmvnavigator_add_pkgconfig_test(): the test of a row with the way pkg-config.
find_program(BDMVNAVIGATOR_PKG_CONFIG pkg-config)
function(bdmvnavigator_add_pkgconfig_test)
  if(NOT BDMVNAVIGATOR_PKG_CONFIG)
    add_test(NAME ${test} COMMAND ${CMAKE_COMMAND} -E echo "skipped: pkg-config is not installed")
    set_tests_properties(${test} PROPERTIES SKIP_REGULAR_EXPRESSION "^skipped: ")
    return()
  endif()
  string(REGEX MATCH "[^\n]+ # ${library}\n" line "${documented}")
  file(WRITE ${folder}/build.sh "${line}")
  configure_file(${clients}/client/player.cpp ${folder}/player.cpp COPYONLY)
  list(JOIN standards "\;" joined_standards)
  list(JOIN CMAKE_CROSSCOMPILING_EMULATOR "\;" emulator)
  add_test(NAME ${test}
    COMMAND ${CMAKE_COMMAND}
      -DLIBRARIES=${prefix_${library}}/${CMAKE_INSTALL_LIBDIR}
      -DCOMPILER=${client_compiler}
      -DFLAGS=${CMAKE_CXX_FLAGS}
      -DSTANDARDS=${joined_standards}
      -DEMULATOR=${emulator}
      -P ${clients}/client/pkgconfig.cmake
    WORKING_DIRECTORY ${folder})
  set_tests_properties(${test} PROPERTIES FIXTURES_REQUIRED "${package_${library}}")
endfunction()

file(STRINGS ${clients}/clients.txt rows REGEX "^[A-Za-z]")
foreach(row IN LISTS rows)
  string(REGEX MATCHALL "[^ ]+" standards "${row}")
  list(POP_FRONT standards way library compiler)
  set(test package.client.${way}.${library}.${compiler})
  bdmvnavigator_client_compiler(${compiler} client_compiler)
  if(client_compiler_missing)
    add_test(NAME ${test} COMMAND ${CMAKE_COMMAND} -E echo "skipped: ${client_compiler_missing}")
    set_tests_properties(${test} PROPERTIES SKIP_REGULAR_EXPRESSION "^skipped: ")
    continue()
  endif()

  set(folder ${CMAKE_CURRENT_BINARY_DIR}/client/${way}_${library}_${compiler})
  set(documented "${lines_${way}}")
  if(way STREQUAL pkg-config)
    bdmvnavigator_add_pkgconfig_test()
    continue()
  endif()

  # Where the lines expect the sources, there is a link to them.
  configure_file(${clients}/client/CMakeLists.txt.in ${folder}/CMakeLists.txt @ONLY)
  file(CREATE_LINK ${sources} ${folder}/bdmvnavigator SYMBOLIC)

  set(options ${build_options})
  list(TRANSFORM options REPLACE
    "^-DCMAKE_CXX_COMPILER=.*" "-DCMAKE_CXX_COMPILER=${client_compiler}")
  list(APPEND options -DCLIENT=${clients}/client)
  if(way STREQUAL installed)
    list(APPEND options -DCMAKE_PREFIX_PATH=${prefix_${library}} ${options_${library}})
  else()
    list(APPEND options -DCMAKE_UNITY_BUILD=ON) # takes a third of the time
    if(library STREQUAL shared)
      list(APPEND options -DBUILD_SHARED_LIBS=ON)
    endif()
  endif()
  add_test(NAME ${test}
    COMMAND ${CMAKE_CTEST_COMMAND} --build-and-test ${folder} ${folder}/build
      --build-generator ${CMAKE_GENERATOR}
      --build-noclean
      --build-options ${options}
      --test-command ${CMAKE_CTEST_COMMAND} --output-on-failure --no-tests=error)
  if(way STREQUAL installed)
    set_tests_properties(${test} PROPERTIES FIXTURES_REQUIRED "${package_${library}}")
  endif()
endforeach()
