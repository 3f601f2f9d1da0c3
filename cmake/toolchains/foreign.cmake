# The common part of the toolchains: Debian's cross compilers, and qemu-user to run programs.
set(CMAKE_SYSTEM_NAME Linux)
set(CMAKE_C_COMPILER ${triplet}-gcc)
set(CMAKE_CXX_COMPILER ${triplet}-g++)
find_program(BDMVNAVIGATOR_EMULATOR ${emulator} REQUIRED)
set(CMAKE_CROSSCOMPILING_EMULATOR ${BDMVNAVIGATOR_EMULATOR} -L /usr/${triplet})

# Libraries and headers come from the target. Packages may come from elsewhere, for example from an
# installation of this project.
set(CMAKE_FIND_ROOT_PATH /usr/${triplet})
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)

# The project's dependencies are not packaged for the target.
set(CMAKE_MODULE_PATH ${CMAKE_CURRENT_LIST_DIR}/../foreign)
