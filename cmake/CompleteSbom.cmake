# Writes the file `document`, an SPDX document, from its template. Adds the Debian packages that the
# dependencies are from; the time, which is SOURCE_DATE_EPOCH, or else the time of the commit in the folder
# `source`; and a name that follows from the contents. Without a time it is the beginning of 1970, so that
# the same sources always give the same document.
cmake_policy(VERSION 3.16)
file(READ ${document}.in text)

# The packages that own the files. They list files of /usr/lib as part of /lib, too.
string(REGEX MATCHALL "@package of [^@]+@" files "${text}")
list(TRANSFORM files REPLACE "@package of (.+)@" "\\1")
set(paths)
foreach(file IN LISTS files)
  get_filename_component(real_file ${file} REALPATH)
  string(REGEX REPLACE "^/usr/" "/" unmerged_file ${real_file})
  set(paths_of_${file} ${file} ${real_file} ${unmerged_file})
  list(APPEND paths ${paths_of_${file}})
endforeach()
execute_process(COMMAND dpkg-query --search ${paths} OUTPUT_VARIABLE lines ERROR_QUIET)
string(REPLACE "\n" ";" lines "${lines}")
set(packages)
foreach(line IN LISTS lines)
  if(line MATCHES "^([a-z0-9][^ ,]+): (/.+)$")
    set(package_of_${CMAKE_MATCH_2} ${CMAKE_MATCH_1})
    list(APPEND packages ${CMAKE_MATCH_1})
  endif()
endforeach()

# Their package URLs.
if(packages)
  list(REMOVE_DUPLICATES packages)
  execute_process(
    COMMAND dpkg-query --show
      "--showformat=\${binary:Package} \${Package}@\${Version}?arch=\${Architecture}\n" ${packages}
    OUTPUT_VARIABLE lines)
  string(REPLACE "\n" ";" lines "${lines}")
  file(STRINGS /etc/os-release distribution REGEX "^ID=")
  file(STRINGS /etc/os-release release REGEX "^VERSION_ID=")
  string(REGEX REPLACE "ID=|\"" "" distribution "${distribution}")
  string(REGEX REPLACE "VERSION_ID=|\"" "" release "${release}") # none in a testing distribution
  foreach(line IN LISTS lines)
    if(line MATCHES "^([^ ]+) (.+)$")
      string(REPLACE "+" "%2B" package ${CMAKE_MATCH_2})
      set(url_of_${CMAKE_MATCH_1} "pkg:deb/${distribution}/${package}&distro=${distribution}-${release}")
    endif()
  endforeach()
endif()
foreach(file IN LISTS files)
  set(references "")
  foreach(path IN LISTS paths_of_${file})
    set(url "${url_of_${package_of_${path}}}")
    if(url)
      set(references "
      \"externalRefs\": [
        {
          \"referenceCategory\": \"PACKAGE-MANAGER\",
          \"referenceType\": \"purl\",
          \"referenceLocator\": \"${url}\"
        }
      ],")
    endif()
  endforeach()
  string(REPLACE "\n      @package of ${file}@" "${references}" text "${text}")
endforeach()

set(given_time "$ENV{SOURCE_DATE_EPOCH}")
if(given_time STREQUAL "")
  execute_process(COMMAND git --git-dir=${source}/.git log -1 --format=%ct
    OUTPUT_VARIABLE commit_time OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET RESULT_VARIABLE status)
  if(NOT status EQUAL 0)
    set(commit_time 0)
  endif()
  set(ENV{SOURCE_DATE_EPOCH} ${commit_time})
endif()
string(TIMESTAMP created "%Y-%m-%dT%H:%M:%SZ" UTC) # of SOURCE_DATE_EPOCH
if(given_time STREQUAL "")
  unset(ENV{SOURCE_DATE_EPOCH})
endif()
string(REPLACE "@created@" "${created}" text "${text}")

# In the name space for URLs.
string(UUID uuid NAMESPACE 6ba7b811-9dad-11d1-80b4-00c04fd430c8 NAME "${text}" TYPE SHA1)
string(REPLACE "@uuid@" "${uuid}" text "${text}")
file(WRITE ${document} "${text}")
