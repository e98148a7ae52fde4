# Compares what a shared library exports with a list: every symbol in full, so that overloads are told apart.
#
#   cmake -DNM=<nm> -DLIBRARY=<file> -DSYMBOLS=<list> [-DUPDATE=ON] -P CheckExports.cmake
#
# What is exported and not listed is an error, and so is what is listed and not exported. With UPDATE the list is written
# anew, for a change of the interface that is meant.
foreach(setting NM LIBRARY SYMBOLS)
    if(NOT ${setting})
        message(FATAL_ERROR "${setting} is not set")
    endif()
endforeach()

execute_process(COMMAND ${NM} -D -C --defined-only ${LIBRARY}
    OUTPUT_VARIABLE output RESULT_VARIABLE result ERROR_VARIABLE trouble)
if(NOT result EQUAL 0)
    message(FATAL_ERROR "${NM}: ${trouble}")
endif()

# <address> <type> <symbol>, where only the symbol says what a caller can reach
string(REGEX REPLACE "(^|\n)[0-9a-f]* +[A-Za-z] " "\\1" output "${output}")
# One spelling, whichever demangler wrote it and whichever standard library stands behind it.
string(REGEX REPLACE "std::__[A-Za-z0-9_]+::" "std::" output "${output}")
string(REGEX REPLACE "> +>" ">>" output "${output}")
string(REGEX REPLACE "> +>" ">>" output "${output}")
# The names that the headers use.
string(REPLACE "ZarnMath::vector2dT<double, true>" "point2d" output "${output}")
string(REPLACE "ZarnMath::vector2dT<double, false>" "vector2d" output "${output}")
string(REGEX REPLACE "Framework::common_types::(POINT|RECT|SIZE)" "\\1" output "${output}")
string(REGEX REPLACE ", std::allocator<(ZarnMath::CubicBezier::bezier2dT<point2d>|[A-Za-z0-9]+)>>" ">" output "${output}")
# Brackets and semicolons would end up in CMake's own lists.
string(REGEX REPLACE "[][;]" "_" output "${output}")

string(REGEX MATCHALL "[^\n]+" exported "${output}")
if(NOT exported)
    message(FATAL_ERROR "${LIBRARY} exports nothing")
endif()
list(REMOVE_DUPLICATES exported) # a constructor has two symbols
list(SORT exported)

if(UPDATE)
    list(JOIN exported "\n" lines)
    file(WRITE ${SYMBOLS} "# What the shared library shows to the outside, and nothing else.\n${lines}\n")
    return()
endif()

file(STRINGS ${SYMBOLS} listed REGEX "^[^#]")
set(unlisted ${exported})
list(REMOVE_ITEM unlisted ${listed})
foreach(symbol IN LISTS unlisted)
    message(SEND_ERROR "exported and not listed: ${symbol}")
endforeach()
set(missing ${listed})
list(REMOVE_ITEM missing ${exported})
foreach(symbol IN LISTS missing)
    message(SEND_ERROR "listed and not exported: ${symbol}")
endforeach()
