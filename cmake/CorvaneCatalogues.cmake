# Compiles message catalogues into a target, so that a library that answers in several languages is
# still one file:
#
#   corvane_catalogues(TARGET NUMBER n FILES a.po b.po ...)
#
# A catalogue is a gettext-style text file in UTF-8, named after its language: pairs of
#   msgid "IDENTIFIER"
#   msgstr "text"
# where a text may go on in further quoted lines, lines that begin with #, and blank lines. The pair
# with the empty identifier is the file's own header. Escapes in texts are those of C. A pair that is
# marked fuzzy is left out, as translators' tools do: its text is a guess.
#
# Run as a script (cmake -DNUMBER=n -DOUTPUT=file.cpp "-DFILES=a.po;b.po" -P CorvaneCatalogues.cmake)
# this same file writes the source; its form is platform/locale/Catalogue.h.

cmake_minimum_required(VERSION 3.25)

function(corvane_catalogues target)
  cmake_parse_arguments(PARSE_ARGV 1 ARG "" "NUMBER" "FILES")
  set(output ${CMAKE_CURRENT_BINARY_DIR}/Catalogues.cpp)
  set(script ${CMAKE_CURRENT_FUNCTION_LIST_FILE})
  add_custom_command(
    OUTPUT ${output}
    COMMAND ${CMAKE_COMMAND} -DNUMBER=${ARG_NUMBER} -DOUTPUT=${output} "-DFILES=${ARG_FILES}" -P ${script}
    DEPENDS ${script} ${ARG_FILES}
    COMMENT "Compiling message catalogues"
    VERBATIM)
  target_sources(${target} PRIVATE ${output})
endfunction()

# Sets OUT to the C++ rows of one catalogue, sorted by identifier.
function(corvane_catalogue_rows file out)
  file(READ ${file} text)
  # Characters that mean something in CMake lists.
  string(ASCII 1 semicolon)
  string(ASCII 2 open)
  string(ASCII 3 close)
  string(ASCII 4 backslash)
  string(REPLACE ";" "${semicolon}" text "${text}")
  string(REPLACE "[" "${open}" text "${text}")
  string(REPLACE "]" "${close}" text "${text}")
  string(REPLACE "\\" "${backslash}" text "${text}")
  string(REPLACE "\r" "" text "${text}")
  string(REPLACE "\n" ";" lines "${text}")

  set(number 0)
  set(state none)
  set(next_is_fuzzy FALSE)
  set(is_fuzzy FALSE)
  set(id "")
  set(translation "")
  set(rows "")
  set(ids "")
  list(APPEND lines "msgid \"\"") # completes the last pair
  foreach(line IN LISTS lines)
    math(EXPR number "${number} + 1")
    if(line MATCHES "^#,.*fuzzy")
      set(next_is_fuzzy TRUE)
    endif()
    if(line MATCHES "^[ \t]*(#.*)?$")
      continue()
    endif()
    if(line MATCHES "^msgid \"([A-Z0-9_]*)\"[ \t]*$")
      set(next "${CMAKE_MATCH_1}")
      if(state STREQUAL "msgid")
        message(FATAL_ERROR "${file}:${number}: msgid \"${id}\" has no msgstr before this line")
      endif()
      if(NOT id STREQUAL "")
        if(NOT is_fuzzy)
          list(APPEND rows "    {L\"${id}\", ${translation}},")
        endif()
        list(APPEND ids "${id}")
      endif()
      set(is_fuzzy ${next_is_fuzzy})
      set(next_is_fuzzy FALSE)
      set(id "${next}")
      set(state msgid)
      if(NOT id STREQUAL "" AND id IN_LIST ids)
        message(FATAL_ERROR "${file}:${number}: msgid \"${id}\" occurs twice; remove one")
      endif()
    elseif(line MATCHES "^msgstr (\".*\")[ \t]*$" AND state STREQUAL "msgid")
      set(translation "L${CMAKE_MATCH_1}")
      set(state msgstr)
    elseif(line MATCHES "^[ \t]*(\".*\")[ \t]*$" AND state STREQUAL "msgstr")
      string(APPEND translation " L${CMAKE_MATCH_1}")
    else()
      message(FATAL_ERROR "${file}:${number}: expected msgid \"IDENTIFIER\", then msgstr \"text\", or a further "
        "quoted line of a text")
    endif()
  endforeach()

  list(SORT rows)
  string(REPLACE ";" "\n" rows "${rows}")
  string(REPLACE "${backslash}" "\\" rows "${rows}")
  string(REPLACE "${close}" "]" rows "${rows}")
  string(REPLACE "${open}" "[" rows "${rows}")
  string(REPLACE "${semicolon}" ";" rows "${rows}")
  set(${out} "${rows}" PARENT_SCOPE)
endfunction()

if(CMAKE_SCRIPT_MODE_FILE STREQUAL CMAKE_CURRENT_LIST_FILE)
  set(tables "")
  set(catalogues "")
  foreach(file IN LISTS FILES)
    get_filename_component(language ${file} NAME_WE)
    corvane_catalogue_rows(${file} rows)
    string(APPEND tables "constexpr Message k_${language}[] = {\n${rows}\n};\n"
      "static_assert(isSorted(k_${language}));\n\n")
    string(APPEND catalogues "    {${NUMBER}, L\"${language}\", k_${language}},\n")
  endforeach()
  file(WRITE ${OUTPUT} "// Made by CorvaneCatalogues.cmake from the catalogues in locale/.\n\n"
    "#include \"platform/locale/Catalogue.h\"\n\n"
    "namespace Tarn::Locale {\nnamespace {\n\n${tables}"
    "constexpr Catalogue allCatalogues[] = {\n${catalogues}};\n\n}  // namespace\n\n"
    "std::span<const Catalogue> catalogues() {\n  return allCatalogues;\n}\n\n}  // namespace Tarn::Locale\n")
endif()
