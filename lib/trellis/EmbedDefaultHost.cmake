# Writes a C++ source that holds the default host description as a string.
file(READ ${INPUT} DESCRIPTION)
set(DELIM "host_json")
file(WRITE ${OUTPUT}.tmp
"// Generated from data/default-host.json; do not edit.\n"
""
"namespace Trellis { namespace Host {\n"
"extern const char* const kDefaultHostDescription;\n"
"const char* const kDefaultHostDescription = R\"${DELIM}(${DESCRIPTION})${DELIM}\";\n"
"} }\n")
file(RENAME ${OUTPUT}.tmp ${OUTPUT})
