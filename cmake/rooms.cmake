# kindrel_room(NAME STANDS_ON room|library… SOURCES file…)
# A room is a static library made of the folder it is declared in. What it stands on is all it can see.
function(kindrel_room name)
    cmake_parse_arguments(room "" "" "STANDS_ON;SOURCES" ${ARGN})
    add_library(${name} STATIC ${room_SOURCES})
    target_include_directories(${name} PUBLIC ${PROJECT_SOURCE_DIR}/src)
    target_link_libraries(${name} PUBLIC ${room_STANDS_ON} PRIVATE kindrel_flags)
endfunction()

# kindrel_program(NAME STANDS_ON room… SOURCES file…)
function(kindrel_program name)
    cmake_parse_arguments(program "" "" "STANDS_ON;SOURCES" ${ARGN})
    add_executable(${name} ${program_SOURCES})
    target_link_libraries(${name} PRIVATE ${program_STANDS_ON} kindrel_flags)
endfunction()

# kindrel_test(NAME STANDS_ON room… SOURCES file… [SCREENS])
# A test program of one room, run by ctest case by case. Those without windows are built by `engine_tests` and carry
# the label `engine`.
add_custom_target(engine_tests)
function(kindrel_test name)
    cmake_parse_arguments(test "SCREENS" "" "STANDS_ON;SOURCES" ${ARGN})
    add_executable(${name} ${test_SOURCES})
    target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests)
    target_link_libraries(${name} PRIVATE ${test_STANDS_ON} kindrel_flags GTest::gtest)
    set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
    if(test_SCREENS)
        set(label screens)
    else()
        set(label engine)
        add_dependencies(engine_tests ${name})
    endif()
    # A test's name stays what its author wrote: a value without a printer would add its bytes.
    gtest_discover_tests(${name} NO_PRETTY_VALUES DISCOVERY_MODE PRE_TEST PROPERTIES TIMEOUT 300 LABELS ${label}
        ENVIRONMENT KINDREL_BIN=${CMAKE_BINARY_DIR}/bin)
endfunction()
