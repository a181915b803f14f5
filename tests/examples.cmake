# SPDX-License-Identifier: Apache-2.0
# Runs every example, and compares the documentation with them.
find_package(Python3 REQUIRED COMPONENTS Interpreter)
set(examples ${PROJECT_SOURCE_DIR}/examples)

function(zelvo_script_test name script)
    add_test(NAME ${name}
        COMMAND ${Python3_EXECUTABLE} ${CMAKE_CURRENT_SOURCE_DIR}/${script} ${ARGN})
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "LC_ALL=C.UTF-8;TZ=UTC")
endfunction()

foreach(example IN ITEMS
        quickstart own_handler reconfigure log_macros configured_tree syslog_handler languages processes
        cpp_quickstart cpp_own_classes cpp_testing)
    zelvo_script_test(${example}_runs check_output
        0 ${examples}/${example}.output $<TARGET_FILE:${example}>)
endforeach()
foreach(file IN ITEMS rules unicode)
    zelvo_script_test(show_config_reads_${file} check_output
        0 ${examples}/properties/${file}.output
        $<TARGET_FILE:show_config> ${examples}/properties/${file}.properties)
endforeach()
foreach(example IN ITEMS record_layouts messages)
    zelvo_script_test(${example}_runs check_output
        0 ${examples}/${example}.output $<TARGET_FILE:${example}>)
    set_tests_properties(${example}_runs PROPERTIES
        WORKING_DIRECTORY ${PROJECT_BINARY_DIR}/examples) # its bundle has a relative path
endforeach()

# What syslog(3) is told beside the text: a stand-in for it prints that.
add_executable(syslog_handler_told ${examples}/syslog_handler.c support/SyslogStandIn.c)
target_link_libraries(syslog_handler_told PRIVATE zelvo::zelvo zelvo_options)
target_compile_options(syslog_handler_told PRIVATE -U_FORTIFY_SOURCE) # which would call another one
get_target_property(definitions syslog_handler COMPILE_DEFINITIONS)
target_compile_definitions(syslog_handler_told PRIVATE ${definitions})
set_target_properties(syslog_handler_told PROPERTIES C_STANDARD 11)
add_dependencies(syslog_handler_told syslog_handler) # its messages
zelvo_script_test(syslog_handler_sends_priorities check_output
    0 ${CMAKE_CURRENT_SOURCE_DIR}/data/syslog_handler_told.output $<TARGET_FILE:syslog_handler_told>)

zelvo_script_test(json_lines_runs check_output
    0 ${examples}/json_lines.output
    ${Python3_EXECUTABLE} ${CMAKE_CURRENT_SOURCE_DIR}/check_json_lines $<TARGET_FILE:json_lines>)
zelvo_script_test(faulty_json_is_noticed check_json_lines
    cp ${CMAKE_CURRENT_SOURCE_DIR}/data/faulty_json_lines.log json_lines.log)
set_tests_properties(faulty_json_is_noticed PROPERTIES PASS_REGULAR_EXPRESSION
    "line 1: no JSON.*line 2: no JSON: a name comes twice.*line 3: half of a surr.*line 3: the time is not that.*line 4: the time is not RFC 3339.*line 4: another process.*the last line has no end")

zelvo_script_test(problem_determination_runs check_output
    0 ${examples}/problem_determination.output
    $<TARGET_FILE:problem_determination> ${examples}/problem_determination/station.properties)
set_tests_properties(problem_determination_runs PROPERTIES
    WORKING_DIRECTORY ${PROJECT_BINARY_DIR}/examples)
zelvo_script_test(daemon_lives check_daemon
    $<TARGET_FILE:daemon> ${examples}/daemon/daemon.properties)
zelvo_script_test(show_config_refuses_a_key_without_dot check_output
    1 ${examples}/properties/no_dot.output
    $<TARGET_FILE:show_config> ${examples}/properties/no_dot.properties)
zelvo_script_test(demo_runs check_demo $<TARGET_FILE:zelvo_demo>)

zelvo_script_test(doc_snippets_are_real check_doc_snippets ${PROJECT_SOURCE_DIR})
zelvo_script_test(an_invented_snippet_is_noticed check_doc_snippets
    ${PROJECT_SOURCE_DIR} ${CMAKE_CURRENT_SOURCE_DIR}/data/invented_snippet.md)
set_tests_properties(an_invented_snippet_is_noticed PROPERTIES
    PASS_REGULAR_EXPRESSION "not found under examples/ or packaging/:.*int invented")

# Pages lead to files, folders and headings that are there.
file(GLOB pages CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/*.md)
zelvo_script_test(links_lead_somewhere check_links
    ${pages} ${PROJECT_SOURCE_DIR}/docs ${PROJECT_SOURCE_DIR}/packaging)
zelvo_script_test(dead_links_are_found check_links ${CMAKE_CURRENT_SOURCE_DIR}/data/dead_links.md)
set_tests_properties(dead_links_are_found PROPERTIES PASS_REGULAR_EXPRESSION
    "no_such_page.md, which is.*#no-such-heading, but.*no_such_page.md#there, which.*1 pages, 5 links, 3 faults")

zelvo_script_test(zelvo_h_leads_to_every_header check_umbrella ${PROJECT_SOURCE_DIR}/include)

# Another project that takes the tree in as a subdirectory.
add_test(NAME subproject_configures
    COMMAND ${CMAKE_COMMAND} -S ${examples}/subproject -B ${CMAKE_CURRENT_BINARY_DIR}/subproject
        -G ${CMAKE_GENERATOR} -DCMAKE_CXX_COMPILER=${CMAKE_CXX_COMPILER}
        -DCMAKE_C_COMPILER=${CMAKE_C_COMPILER})
