# SPDX-License-Identifier: Apache-2.0
# Writes one ctest test for each suite of a GoogleTest program. A process for each of some thousand
# tests would take longer than all that they do.
# Variables: PROGRAM, OUTPUT, ENVIRONMENT (a list).
execute_process(COMMAND ${PROGRAM} --gtest_list_tests
    OUTPUT_VARIABLE listing COMMAND_ERROR_IS_FATAL ANY)
string(REGEX MATCHALL "\n[^ \n][^\n]*\\." suites "\n${listing}")
set(script "")
foreach(suite IN LISTS suites)
    string(STRIP "${suite}" suite)
    string(REGEX REPLACE "\\.$" "" name "${suite}")
    string(APPEND script "add_test([==[${name}]==] \"${PROGRAM}\" \"--gtest_filter=${suite}*\")\n"
        "set_tests_properties([==[${name}]==] PROPERTIES ENVIRONMENT \"${ENVIRONMENT}\")\n")
endforeach()
file(WRITE ${OUTPUT} "${script}")
