# SPDX-License-Identifier: Apache-2.0
# What zelvo_harden() promises, read from the library that was built, and from one without it all.
set(check ${CMAKE_CURRENT_SOURCE_DIR}/abi/check_hardening)
add_test(NAME the_library_is_hardened
    COMMAND ${check} $<TARGET_FILE:zelvo> $<TARGET_SONAME_FILE_NAME:zelvo>
        $<TARGET_FILE:zelvo_static>)

set(bare zelvo_unhardened zelvo_unhardened_static)
add_library(zelvo_unhardened SHARED abi/unhardened.c)
add_library(zelvo_unhardened_static STATIC abi/unhardened.c)
set_target_properties(${bare} PROPERTIES POSITION_INDEPENDENT_CODE OFF)
foreach(target IN LISTS bare)
    target_compile_options(${target} PRIVATE -U_FORTIFY_SOURCE -fno-stack-protector
        -fno-stack-clash-protection -fcf-protection=none -fno-pic -mcmodel=large)
endforeach()
target_link_options(zelvo_unhardened PRIVATE
    LINKER:-z,norelro,-z,lazy,-z,execstack,-z,notext LINKER:-rpath,/nowhere)
add_test(NAME a_library_that_is_not_hardened_is_found
    COMMAND ${check} $<TARGET_FILE:zelvo_unhardened> libother.so.1
        $<TARGET_FILE:zelvo_unhardened_static>)
set_tests_properties(a_library_that_is_not_hardened_is_found PROPERTIES
    PASS_REGULAR_EXPRESSION "2 exported functions, 14 faults")
