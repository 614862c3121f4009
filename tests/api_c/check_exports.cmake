# Checks the dynamic symbol table of the shared library: the names starting with "qr" must be
# exactly the entry points (less those not yet provided), and no C++ symbol of the library's own
# namespaces may be exported.
#
# cmake -DNM=<nm> -DLIBRARY=<libquire.so> -DEXPECTED=<entry_points.txt>
#       -DNOT_YET=<not_yet_exported.txt> -P check_exports.cmake

foreach(var NM LIBRARY EXPECTED NOT_YET)
  if(NOT DEFINED ${var})
    message(FATAL_ERROR "${var} is not set")
  endif()
endforeach()

execute_process(COMMAND "${NM}" -D --defined-only "${LIBRARY}"
                OUTPUT_VARIABLE symbols_text RESULT_VARIABLE nm_result ERROR_VARIABLE nm_error)
if(NOT nm_result EQUAL 0)
  message(FATAL_ERROR "${NM} failed on ${LIBRARY}: ${nm_error}")
endif()

file(STRINGS "${EXPECTED}" expected REGEX "^qr")
file(STRINGS "${NOT_YET}" not_yet REGEX "^qr")
if(not_yet)
  list(REMOVE_ITEM expected ${not_yet})
endif()

set(exported)
set(leaked)
string(REPLACE "\n" ";" lines "${symbols_text}")
foreach(line IN LISTS lines)
  # "<address> <type> <name>[@version]"
  if(line MATCHES "^[0-9a-fA-F]* *[A-Za-z] ([^@ ]+)")
    set(name "${CMAKE_MATCH_1}")
    if(name MATCHES "^qr")
      list(APPEND exported "${name}")
    elseif(name MATCHES "^_Z.*(5quire|3lmx)")
      list(APPEND leaked "${name}")
    endif()
  endif()
endforeach()

set(missing ${expected})
if(exported)
  list(REMOVE_ITEM missing ${exported})
endif()
set(unexpected ${exported})
if(expected)
  list(REMOVE_ITEM unexpected ${expected})
endif()

list(LENGTH expected expected_count)
list(LENGTH exported exported_count)
set(failed FALSE)
if(missing)
  string(REPLACE ";" "\n  " text "${missing}")
  message("Entry points not exported:\n  ${text}")
  set(failed TRUE)
endif()
if(unexpected)
  string(REPLACE ";" "\n  " text "${unexpected}")
  message("Exported but not expected:\n  ${text}")
  set(failed TRUE)
endif()
if(leaked)
  string(REPLACE ";" "\n  " text "${leaked}")
  message("C++ symbols of the library exported:\n  ${text}")
  set(failed TRUE)
endif()
if(failed)
  message(FATAL_ERROR "export check failed (${exported_count} exported, ${expected_count} expected)")
endif()
message(STATUS "${exported_count} entry points exported, as expected")
