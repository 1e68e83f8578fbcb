# Generates what derives from the export table entries/exports.table.
#
#   cmake -P tools/gen_exports.cmake                  rewrite include/tsmath/tsmath_exports.h
#   cmake -DMAP=out.map -P tools/gen_exports.cmake    write the linker version script
#   cmake -DCHECK=1 -P tools/gen_exports.cmake        fail if the committed header is stale
#   cmake -DLIB=libtsmath.so -DNM=nm -P tools/gen_exports.cmake
#                                                     fail unless nm -D shows exactly the table
cmake_minimum_required(VERSION 3.25)
get_filename_component(root "${CMAKE_CURRENT_LIST_DIR}/.." ABSOLUTE)
set(table "${root}/entries/exports.table")
set(header "${root}/include/tsmath/tsmath_exports.h")

file(STRINGS "${table}" lines)
set(names "")
set(decls "")
foreach(line IN LISTS lines)
  if(line MATCHES "^## (.*)$")
    string(APPEND decls "\n/* ${CMAKE_MATCH_1} */\n")
  elseif(line MATCHES "^#" OR line STREQUAL "")
  elseif(line MATCHES "^([A-Za-z_][A-Za-z0-9_]*)\t([^\t]+)\t([^\t]*)$")
    list(APPEND names "${CMAKE_MATCH_1}")
    string(APPEND decls "TSM_API ${CMAKE_MATCH_2} ${CMAKE_MATCH_1}(${CMAKE_MATCH_3});\n")
  else()
    message(FATAL_ERROR "exports.table: cannot read line: ${line}")
  endif()
endforeach()
list(LENGTH names count)
list(REMOVE_DUPLICATES names)
list(LENGTH names unique)
if(NOT count EQUAL unique)
  message(FATAL_ERROR "exports.table: a name stands twice")
endif()

set(text "/* Automatically generated from entries/exports.table, do not edit.
 * Regenerate: cmake -P tools/gen_exports.cmake
 * ${count} exports. Included by tsmath.h inside its extern \"C\" block. */
#ifndef TSMATH_EXPORTS_H
#define TSMATH_EXPORTS_H
${decls}
#endif
")

if(DEFINED MAP)
  set(map "{\n  global:\n")
  foreach(n IN LISTS names)
    string(APPEND map "    ${n};\n")
  endforeach()
  string(APPEND map "  local:\n    *;\n};\n")
  file(WRITE "${MAP}" "${map}")
elseif(DEFINED CHECK)
  file(READ "${header}" have)
  if(NOT have STREQUAL text)
    message(FATAL_ERROR "include/tsmath/tsmath_exports.h is stale: run cmake -P tools/gen_exports.cmake")
  endif()
  message(STATUS "header matches the export table (${count} exports)")
elseif(DEFINED LIB)
  execute_process(COMMAND "${NM}" -D --defined-only "${LIB}" OUTPUT_VARIABLE out RESULT_VARIABLE rc)
  if(NOT rc EQUAL 0)
    message(FATAL_ERROR "nm failed on ${LIB}")
  endif()
  string(REPLACE "\n" ";" out "${out}")
  set(shown "")
  foreach(l IN LISTS out)
    if(l MATCHES "^[0-9a-fA-F]+ [A-Za-z] ([^ @]+)")
      list(APPEND shown "${CMAKE_MATCH_1}")
    endif()
  endforeach()
  list(REMOVE_DUPLICATES shown)
  set(extra ${shown})
  list(REMOVE_ITEM extra ${names})
  set(missing ${names})
  list(REMOVE_ITEM missing ${shown})
  if(extra OR missing)
    message(FATAL_ERROR "exports differ from the table\n  not in the table: ${extra}\n  missing: ${missing}")
  endif()
  message(STATUS "nm -D shows exactly the ${count} exports of the table")
else()
  file(WRITE "${header}" "${text}")
  message(STATUS "wrote ${header} (${count} exports)")
endif()
