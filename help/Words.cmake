# The table of the instrument's words as a page, out of what `zelctl words` prints.

execute_process(COMMAND "${ZELCTL}" words OUTPUT_VARIABLE lines COMMAND_ERROR_IS_FATAL ANY)
string(REPLACE "|" "\\|" lines "${lines}")
string(REPLACE ";" "," lines "${lines}")
string(REGEX REPLACE "([^\t\n]*)\t([^\t\n]*)\t([^\t\n]*)\t([^\n]*)\n"
    "| `\\1` | \\2 | \\3 | \\4 |\n" rows "${lines}")
file(WRITE "${OUTPUT}" "# Words of the instrument

What the manual line, scripts and `zelctl get`, `set` and `cmd` send; `zelctl words` prints this \
table. A setting is the word, a comma and the value; numbers have a point and no unit.

| word | meaning | unit | range or codes |
| --- | --- | --- | --- |
${rows}")
