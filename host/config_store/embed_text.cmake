# Writes a C++ source file that defines a variable with the content of a text file.
# Usage: cmake -D INPUT=... -D OUTPUT=... -D HEADER=... -D NAMESPACE=... -D VARIABLE=... -P embed_text.cmake
file(READ "${INPUT}" text)
set(delimiter "embedded_text")
string(FIND "${text}" ")${delimiter}\"" position)
if(NOT position EQUAL -1)
  message(FATAL_ERROR "${INPUT} holds the text that ends a literal: )${delimiter}\"")
endif()
file(
  WRITE "${OUTPUT}"
  "#include \"${HEADER}\"\n\n"
  "namespace ${NAMESPACE} {\n\n"
  "const char *const ${VARIABLE} = R\"${delimiter}(${text})${delimiter}\";\n\n"
  "}  // namespace ${NAMESPACE}\n")
