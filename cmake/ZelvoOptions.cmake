# SPDX-License-Identifier: Apache-2.0
# The compiler settings that the library and its examples share, and those of the tests: they are
# compiled far more often than they run, so they take no time for optimisation; and of undefined
# behaviour the library is suspected, not they.
set(ZELVO_SANITIZE_TESTS ${ZELVO_SANITIZE})
list(TRANSFORM ZELVO_SANITIZE_TESTS REPLACE ",undefined" "")

function(zelvo_settings settings sanitizers)
    add_library(${settings} INTERFACE)
    target_compile_options(${settings} INTERFACE
        -Wall -Wextra -Wpedantic -Wconversion -Wshadow
        $<$<BOOL:${ZELVO_WARNINGS_AS_ERRORS}>:-Werror>)
    if(sanitizers)
        target_compile_options(${settings} INTERFACE
            -fsanitize=${sanitizers} -fno-sanitize-recover=all -fno-omit-frame-pointer)
        target_link_options(${settings} INTERFACE -fsanitize=${ZELVO_SANITIZE})
        # C programs are linked with a library that has been checked as C++.
        if(CMAKE_CXX_COMPILER_ID MATCHES Clang)
            target_link_options(${settings} INTERFACE -fsanitize-link-c++-runtime)
            target_link_libraries(${settings} INTERFACE stdc++)
        endif()
    endif()
    if(ZELVO_COVERAGE)
        target_compile_options(${settings} INTERFACE --coverage -fprofile-update=atomic)
        target_link_options(${settings} INTERFACE --coverage)
    endif()
endfunction()
zelvo_settings(zelvo_options "${ZELVO_SANITIZE}")
zelvo_settings(zelvo_test_options "${ZELVO_SANITIZE_TESTS}")
target_compile_options(zelvo_test_options INTERFACE -O0)
if(ZELVO_SANITIZE)
    target_compile_definitions(zelvo_test_options INTERFACE ZELVO_SANITIZED)
endif()

if(ZELVO_FUZZ)
    target_compile_options(zelvo_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

# What makes a fault in the library harder to exploit. It goes into delivered builds: the checked
# library functions need optimisation, and sanitizers bring checks of their own. A function and not
# part of zelvo_options, because link options would reach whoever links the static library.
if(ZELVO_SANITIZE)
    set(ZELVO_DELIVERED 0)
else()
    set(ZELVO_DELIVERED $<CONFIG:Release,RelWithDebInfo,MinSizeRel>)
endif()

# A delivered build does not depend on where it was made: paths in it begin at the source tree.
function(zelvo_map_paths target)
    foreach(directory IN ITEMS ${PROJECT_SOURCE_DIR} ${PROJECT_BINARY_DIR})
        target_compile_options(${target} PRIVATE
            $<${ZELVO_DELIVERED}:-ffile-prefix-map=${directory}=.>)
    endforeach()
endfunction()

function(zelvo_harden objects library)
    set(compile -U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=3 -fstack-protector-strong -fstack-clash-protection)
    set(link LINKER:-z,relro LINKER:-z,now LINKER:-z,noexecstack)
    if(CMAKE_SYSTEM_PROCESSOR MATCHES "^(x86_64|AMD64)$")
        list(APPEND compile -fcf-protection=full)
        # The linker marks a library only if each object carries the mark, and the start files of
        # Debian's C library do not. All that they bring and somebody calls through a pointer is
        # _init and _fini, which do nothing: without them the mark tells the truth.
        list(APPEND link LINKER:-z,ibt LINKER:-z,shstk LINKER:-init=,-fini=)
    endif()
    target_compile_options(${objects} PRIVATE "$<${ZELVO_DELIVERED}:${compile}>")
    target_link_options(${library} PRIVATE "$<${ZELVO_DELIVERED}:${link}>")
endfunction()
