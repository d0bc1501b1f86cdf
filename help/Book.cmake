# The project of the book, out of its pages, and the book.

string(REPLACE "," ";" pages "${PAGES}")
set(sections "")
set(keywords "")
set(files "<file>style.css</file><file>panel.png</file>")
foreach(page IN LISTS pages)
    string(REGEX MATCH "^[^:]*" source "${page}")
    get_filename_component(name "${source}" NAME_WE)
    file(READ "${HTML}/${name}.html" text)
    string(REGEX MATCH "<title>([^<]*)</title>" ignored "${text}")
    set(title "${CMAKE_MATCH_1}")
    string(APPEND sections "<section title=\"${title}\" ref=\"${name}.html\"/>\n")
    string(APPEND files "<file>${name}.html</file>")
    string(APPEND keywords "<keyword name=\"${title}\" id=\"page_${name}\" ref=\"${name}.html\"/>\n")
    if(page MATCHES ":(.*)$")
        string(REPLACE "+" ";" contexts "${CMAKE_MATCH_1}")
        foreach(context IN LISTS contexts)
            string(APPEND keywords
                "<keyword name=\"${title}\" id=\"context_${context}\" ref=\"${name}.html\"/>\n")
        endforeach()
    endif()
    string(REGEX MATCHALL "<code id=\"[A-Za-z0-9_]+" anchors "${text}")
    foreach(anchor IN LISTS anchors)
        string(REGEX REPLACE ".*\"" "" word "${anchor}")
        string(APPEND keywords
            "<keyword name=\"${word}\" id=\"${name}_${word}\" ref=\"${name}.html#${word}\"/>\n")
    endforeach()
endforeach()
file(WRITE "${HTML}/zelremote.qhp" "<?xml version=\"1.0\" encoding=\"UTF-8\"?>
<QtHelpProject version=\"1.0\">
<namespace>example.zelremote.help</namespace>
<virtualFolder>book</virtualFolder>
<filterSection>
<toc><section title=\"ZELRemote\" ref=\"index.html\">
${sections}</section></toc>
<keywords>${keywords}</keywords>
<files>${files}</files>
</filterSection>
</QtHelpProject>
")
execute_process(COMMAND "${GENERATOR}" "${HTML}/zelremote.qhp" -o "${BOOK}"
    OUTPUT_VARIABLE output ERROR_VARIABLE output RESULT_VARIABLE status)
file(REMOVE "${HTML}/zelremote.qhp")
if(NOT status EQUAL 0 OR NOT EXISTS "${BOOK}")
    message(FATAL_ERROR "The help book cannot be made:\n${output}")
endif()
