include(CheckCXXCompilerFlag)

# Old compilers lack these options: g++ has the first since version 5, the second since version 8;
# clang++ has the third since version 3.8.
check_cxx_compiler_flag(-fno-semantic-interposition BDMVNAVIGATOR_HAS_NO_SEMANTIC_INTERPOSITION)
check_cxx_compiler_flag(-fmacro-prefix-map=from=to BDMVNAVIGATOR_HAS_MACRO_PREFIX_MAP)
check_cxx_compiler_flag(-fdebug-prefix-map=from=to BDMVNAVIGATOR_HAS_DEBUG_PREFIX_MAP)

# The compiler options of every target of this project.
#
# bdmvnavigator_target_options(TARGET [CXX_STANDARD N])
#
# N defaults to 17: only the library itself is limited to C++11, because player toolchains lag.
function(bdmvnavigator_target_options target)
  cmake_parse_arguments(arg "" "CXX_STANDARD" "" ${ARGN})
  if(NOT arg_CXX_STANDARD)
    set(arg_CXX_STANDARD 17)
  endif()
  set_target_properties(${target} PROPERTIES
    CXX_STANDARD ${arg_CXX_STANDARD}
    CXX_STANDARD_REQUIRED ON
    CXX_EXTENSIONS OFF
    C_STANDARD 99
    C_EXTENSIONS OFF)
  # An archive may become part of a client's shared library.
  get_target_property(type ${target} TYPE)
  if(type STREQUAL STATIC_LIBRARY AND NOT DEFINED CMAKE_POSITION_INDEPENDENT_CODE)
    set_target_properties(${target} PROPERTIES POSITION_INDEPENDENT_CODE ON)
  endif()
  # Without it g++ inlines no function of a position-independent library that others can call.
  if(BDMVNAVIGATOR_HAS_NO_SEMANTIC_INTERPOSITION)
    target_compile_options(${target} PRIVATE
      $<$<COMPILE_LANGUAGE:CXX>:-fno-semantic-interposition>)
  endif()
  target_compile_options(${target} PRIVATE
    -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Wformat=2
    $<$<COMPILE_LANGUAGE:CXX>:-Wnon-virtual-dtor>
    $<$<COMPILE_LANGUAGE:CXX>:-Woverloaded-virtual>)
  # Assertions name their file; the name must not depend on the source or build directory.
  if(BDMVNAVIGATOR_HAS_MACRO_PREFIX_MAP)
    target_compile_options(${target} PRIVATE
      $<$<COMPILE_LANGUAGE:CXX>:-fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=>)
  else()
    bdmvnavigator_name_files(${target})
  endif()
  # The same for debug information, so that two builds give the same bytes. Within another project, its
  # developers step into this one, and their debuggers find the sources.
  if(BDMVNAVIGATOR_HAS_DEBUG_PREFIX_MAP AND BDMVNAVIGATOR_IS_TOP_LEVEL)
    target_compile_options(${target} PRIVATE
      -fdebug-prefix-map=${PROJECT_SOURCE_DIR}/= -fdebug-prefix-map=${PROJECT_BINARY_DIR}=.)
  endif()
  if(BDMVNAVIGATOR_WARNINGS_AS_ERRORS)
    target_compile_options(${target} PRIVATE -Werror)
  endif()
endfunction()

# bdmvnavigator_name_files(TARGET): defines __FILE__ for each C++ source of the target as its path in the
# repository. No header of the library has an assertion of its own.
function(bdmvnavigator_name_files target)
  get_target_property(sources ${target} SOURCES)
  foreach(source IN LISTS sources)
    get_filename_component(path ${source} ABSOLUTE)
    file(RELATIVE_PATH name ${PROJECT_SOURCE_DIR} ${path})
    if(name MATCHES "\\.cpp$")
      set_property(SOURCE ${source} APPEND PROPERTY COMPILE_OPTIONS
        -Wno-builtin-macro-redefined "-D__FILE__=\"${name}\"")
    endif()
  endforeach()
endfunction()

# bdmvnavigator_sources_of(TARGET VARIABLE): the paths of its sources, to compile them with other
# options.
function(bdmvnavigator_sources_of target variable)
  get_target_property(sources ${target} SOURCES)
  get_target_property(folder ${target} SOURCE_DIR)
  list(TRANSFORM sources PREPEND ${folder}/)
  set(${variable} ${sources} PARENT_SCOPE)
endfunction()
