# SPDX-License-Identifier: Apache-2.0
# The compiler settings that the library, its examples and its tests share.
add_library(zelvo_options INTERFACE)
target_compile_options(zelvo_options INTERFACE
    -Wall -Wextra -Wpedantic -Wconversion -Wshadow
    $<$<BOOL:${ZELVO_WARNINGS_AS_ERRORS}>:-Werror>)

if(ZELVO_SANITIZE)
    target_compile_options(zelvo_options INTERFACE
        -fsanitize=${ZELVO_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
    target_link_options(zelvo_options INTERFACE -fsanitize=${ZELVO_SANITIZE})
endif()

if(ZELVO_FUZZ)
    target_compile_options(zelvo_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

if(ZELVO_COVERAGE)
    target_compile_options(zelvo_options INTERFACE --coverage -fprofile-update=atomic)
    target_link_options(zelvo_options INTERFACE --coverage)
endif()
