# One page: Markdown to HTML. The title is the first heading; links to .md files become links to
# pages; the first word of a table's row gets an anchor of its name.

execute_process(COMMAND "${CMARK}" -e table --to html "${SOURCE}" OUTPUT_VARIABLE body
    COMMAND_ERROR_IS_FATAL ANY)
string(REGEX MATCH "<h1>([^<]*)</h1>" heading "${body}")
set(title "${CMAKE_MATCH_1}")
if(title STREQUAL "")
    message(FATAL_ERROR "${SOURCE} has no heading")
endif()
# Pictures and pages lie in one folder.
string(REGEX REPLACE "(href|src)=\"(\\.\\./)?(docs/|help/|images/)+" "\\1=\"" body "${body}")
string(REGEX REPLACE "href=\"([A-Za-z0-9_-]+)\\.md" "href=\"\\1.html" body "${body}")
string(REGEX REPLACE "<tr>\n<td><code>([A-Za-z0-9_]+)" "<tr>\n<td><code id=\"\\1\">\\1" body "${body}")
file(WRITE "${OUTPUT}" "<!DOCTYPE html>
<html lang=\"en\"><head><meta charset=\"utf-8\"><title>${title}</title>
<link rel=\"stylesheet\" href=\"style.css\"></head>
<body>
${body}
<p class=\"foot\"><a href=\"index.html\">ZELRemote ${VERSION}</a></p>
</body></html>
")
