# Compares the names that a shared library exports with a list.
#
#   cmake -DNM=<nm> -DLIBRARY=<file> -DNAMES=<list> [-DREQUIRE_ALL=ON] -P CheckExports.cmake
#
# A name that is exported and not listed is an error; a listed one that is not exported is an error with REQUIRE_ALL, and
# mentioned without it.
foreach(setting NM LIBRARY NAMES)
    if(NOT ${setting})
        message(FATAL_ERROR "${setting} is not set")
    endif()
endforeach()

execute_process(COMMAND ${NM} -D -C --defined-only ${LIBRARY}
    OUTPUT_VARIABLE symbols RESULT_VARIABLE result ERROR_VARIABLE trouble)
if(NOT result EQUAL 0)
    message(FATAL_ERROR "${NM}: ${trouble}")
endif()
# Brackets and semicolons would end up in CMake's own lists.
string(REGEX REPLACE "[][;]" "_" symbols "${symbols}")
string(REGEX MATCHALL "[^\n]+" lines "${symbols}")
if(NOT lines)
    message(FATAL_ERROR "${LIBRARY} exports nothing")
endif()

file(STRINGS ${NAMES} listed REGEX "^[^#]")
set(missing ${listed})
foreach(line IN LISTS lines)
    # <address> <type> [<result of a template> ]<qualified name>[<...>][(...)...]
    string(REGEX REPLACE "^[0-9a-f]* *[A-Za-z] " "" symbol "${line}")
    string(REGEX REPLACE "[<(].*$" "" name "${symbol}")
    string(REGEX REPLACE "^.* " "" name "${name}")
    set(entry "")
    foreach(candidate IN LISTS listed)
        if(name STREQUAL candidate)
            set(entry "${candidate}")
        elseif(candidate MATCHES "::$")
            string(FIND "${name}" "${candidate}" position)
            if(position EQUAL 0)
                set(entry "${candidate}")
            endif()
        endif()
    endforeach()
    if(entry STREQUAL "")
        message(SEND_ERROR "exported and not listed: ${symbol}")
    else()
        list(REMOVE_ITEM missing "${entry}")
    endif()
endforeach()

foreach(name IN LISTS missing)
    if(REQUIRE_ALL)
        message(SEND_ERROR "listed and not exported: ${name}")
    else()
        message(STATUS "listed and not exported: ${name}")
    endif()
endforeach()
