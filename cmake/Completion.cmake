# Writes the file that completes the command line of `program` in a `shell`.
get_filename_component(folder ${file} DIRECTORY)
file(MAKE_DIRECTORY ${folder})
execute_process(COMMAND ${program} completion ${shell} OUTPUT_FILE ${file}.part COMMAND_ERROR_IS_FATAL ANY)
file(RENAME ${file}.part ${file})
