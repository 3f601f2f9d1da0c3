# Writes the file `document`, an SPDX document, from its template: adds the time, which is SOURCE_DATE_EPOCH
# or else the time of the commit in the folder `source`, and a name that follows from the contents. Without
# either the time is the beginning of 1970, so that the same sources always give the same document.
cmake_policy(VERSION 3.16)
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

file(READ ${document}.in text)
string(REPLACE "@created@" "${created}" text "${text}")
# In the name space for URLs.
string(UUID uuid NAMESPACE 6ba7b811-9dad-11d1-80b4-00c04fd430c8 NAME "${text}" TYPE SHA1)
string(REPLACE "@uuid@" "${uuid}" text "${text}")
file(WRITE ${document} "${text}")
