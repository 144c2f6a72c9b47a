# Writes OUTPUT, a C++ source whose EmbeddedStringTable() returns the text of
# INPUT unchanged (a raw string literal).
file(READ ${INPUT} content)
set(delimiter "kelqln_strings")
string(FIND "${content}" ")${delimiter}\"" clash)
if(NOT clash EQUAL -1)
  message(FATAL_ERROR "${INPUT} contains the literal's closing delimiter")
endif()
file(WRITE ${OUTPUT}
  "// Generated from strings.tsv at build time; do not edit.\n"
  "#include \"host/strings/string_table.h\"\n\n"
  "namespace host::strings {\n\n"
  "std::string_view EmbeddedStringTable() {\n"
  "  return R\"${delimiter}(${content})${delimiter}\";\n"
  "}\n\n"
  "}  // namespace host::strings\n")
