# SPDX-License-Identifier: Apache-2.0
# Checks of what was written and built, which run none of it.

# Each public header stands on its own, in both languages.
file(GLOB ZELVO_HEADERS CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/include/*.h)
set(strict -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror -fsyntax-only)
foreach(header IN LISTS ZELVO_HEADERS)
    cmake_path(GET header STEM name)
    add_test(NAME header_${name}_is_C99
        COMMAND ${CMAKE_C_COMPILER} -std=c99 -pedantic ${strict} -x c ${header})
    add_test(NAME header_${name}_is_CXX20
        COMMAND ${CMAKE_CXX_COMPILER} -std=c++20 ${strict} -x c++ ${header})
endforeach()

# Every public declaration carries its contract; the check itself finds each kind of fault.
add_test(NAME contracts_are_stated
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_contracts ${ZELVO_HEADERS})
add_test(NAME contracts_missing_are_found
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_contracts ${CMAKE_CURRENT_SOURCE_DIR}/abi/no_contract.h)
set_tests_properties(contracts_missing_are_found PROPERTIES PASS_REGULAR_EXPRESSION "6 faults")
file(GLOB ZELVO_CPP_HEADERS CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/include/*.hpp)
add_test(NAME cpp_contracts_are_stated
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_cpp_contracts ${ZELVO_CPP_HEADERS})
add_test(NAME cpp_contracts_missing_are_found
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_cpp_contracts ${CMAKE_CURRENT_SOURCE_DIR}/abi/no_contract.hpp)
set_tests_properties(cpp_contracts_missing_are_found PROPERTIES PASS_REGULAR_EXPRESSION "10 faults")

# What ./run coverage does with the branches that it has measured finds those that no test takes.
add_test(NAME branches_not_taken_are_found
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_branches ${CMAKE_CURRENT_SOURCE_DIR}/data/coverage.json)
set_tests_properties(branches_not_taken_are_found PROPERTIES PASS_REGULAR_EXPRESSION
    "Mutex.cpp:1: 2 not taken.*ZlvFileHandler.cpp: not measured.*1 named unreachable, but taken")

# The container families are what their generators write.
add_test(NAME containers_are_regenerated COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_containers)

# The shared library exports what the list says.
add_test(NAME exports_are_as_listed
    COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check_exports
        $<TARGET_FILE:zelvo> ${CMAKE_CURRENT_SOURCE_DIR}/abi/exports.txt)

# The shared library has the protection that delivered builds are given.
if(CMAKE_BUILD_TYPE STREQUAL Release AND NOT ZELVO_SANITIZE
        AND CMAKE_SYSTEM_PROCESSOR STREQUAL x86_64)
    include(hardening.cmake)
endif()
