# Runs once while the house is built: lays the master database and the training church beside the programs. A leak check
# would stumble over the painter's threads, which may still be ending then.
kindrel_program(kindrel-make-data STANDS_ON sample SOURCES make_data.cpp)

set(data_folder ${CMAKE_RUNTIME_OUTPUT_DIRECTORY})
set(data_mark ${CMAKE_CURRENT_BINARY_DIR}/program_data.mark)
add_custom_command(
    OUTPUT ${data_mark}
    COMMAND ${CMAKE_COMMAND} -E rm -rf ${data_folder}/master ${data_folder}/Training
    COMMAND ${CMAKE_COMMAND} -E env ASAN_OPTIONS=detect_leaks=0 $<TARGET_FILE:kindrel-make-data> ${data_folder}
    COMMAND ${CMAKE_COMMAND} -E touch ${data_mark}
    DEPENDS kindrel-make-data
    COMMENT "Making the master database and the training church"
    VERBATIM)
add_custom_target(program_data ALL DEPENDS ${data_mark})
