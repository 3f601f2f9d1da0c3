# Validates the modules in LIBRARIES, then builds and runs player.cpp with the line in build.sh: once for
# each of STANDARDS, and once without exceptions. Then, where they are installed, builds and runs programs
# with the modules of the kits and of the desk player.
set(ENV{PKG_CONFIG_PATH} ${LIBRARIES}/pkgconfig)
set(ENV{LD_LIBRARY_PATH} ${LIBRARIES})

# The line calls c++: this compiler, with the options in CXXFLAGS.
set(compiler ${CMAKE_CURRENT_BINARY_DIR}/compiler)
file(CONFIGURE OUTPUT ${compiler}/c++ CONTENT "#!/bin/sh\nexec ${COMPILER} $CXXFLAGS \"$@\"\n" @ONLY)
file(CHMOD ${compiler}/c++ PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE)
set(ENV{PATH} ${compiler}:$ENV{PATH})

include(${CMAKE_CURRENT_LIST_DIR}/../run.cmake)

file(GLOB modules ${LIBRARIES}/pkgconfig/bdmvnavigator*.pc)
if(NOT modules)
  message(FATAL_ERROR "no modules in ${LIBRARIES}/pkgconfig")
endif()
foreach(module IN LISTS modules)
  execute_process(COMMAND pkg-config --validate ${module}
    RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE output)
  if(status OR output) # a warning is no failure to pkg-config
    message(FATAL_ERROR "${module} is not valid: ${output}")
  endif()
  file(STRINGS ${module} private REGEX "^Libs.private: -pthread$")
  if(NOT private)
    message(FATAL_ERROR "${module} has no Libs.private with -pthread")
  endif()
endforeach()

list(TRANSFORM STANDARDS REPLACE "^23$" "2b") # the name that older compilers know
list(TRANSFORM STANDARDS PREPEND "-std=c++")
foreach(options IN LISTS STANDARDS ITEMS "-std=c++11 -fno-exceptions")
  set(ENV{CXXFLAGS} "${FLAGS} ${options} -Wall -Wextra -Wpedantic -Werror")
  file(REMOVE player)
  run("building with ${options}" sh build.sh)
  run("player, built with ${options}," ${EMULATOR} ./player)
endforeach()

# build_and_run(SOURCE MODULES...)
function(build_and_run source)
  foreach(module IN LISTS ARGN)
    if(NOT EXISTS ${LIBRARIES}/pkgconfig/${module}.pc)
      return()
    endif()
  endforeach()
  list(JOIN ARGN " " modules)
  set(ENV{CXXFLAGS} "${FLAGS} -std=c++17 -Wall -Wextra -Wpedantic -Werror")
  file(REMOVE player)
  run("building ${source}" sh -c
    "c++ ${CMAKE_CURRENT_LIST_DIR}/${source} $(pkg-config --static --cflags --libs ${modules}) -o player")
  run("${source}" ${EMULATOR} ./player)
endfunction()

build_and_run(kits.cpp bdmvnavigator-navigatorkit bdmvnavigator-clientkit bdmvnavigator-testkit)
build_and_run(desk.cpp bdmvnavigator-deskplayer bdmvnavigator-linux)
