# Writes the modules of the schema as one file, content unchanged: xsdcxx takes one file at a time, each complete
# in itself, and one of the modules uses what only the whole has.
#
#     cmake -DSCHEMA=<folder> -DOUTPUT=<file> -P merge_schema.cmake
file(READ ${SCHEMA}/vrl.xsd whole)
string(REGEX MATCHALL "[a-z_]+\\.xsd" modules "${whole}")
set(content "")
foreach(module IN LISTS modules)
    file(READ ${SCHEMA}/${module} text)
    string(REGEX REPLACE "^.*<xs:schema[^>]*>" "" text "${text}")
    string(REGEX REPLACE "<xs:include [^>]*>" "" text "${text}")
    string(REPLACE "</xs:schema>" "" text "${text}")
    string(APPEND content "${text}")
endforeach()
string(REGEX REPLACE "<xs:include [^>]*>" "" whole "${whole}")
string(REPLACE "</xs:schema>" "${content}</xs:schema>" whole "${whole}")
file(WRITE ${OUTPUT} "${whole}")
