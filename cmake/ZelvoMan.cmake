# SPDX-License-Identifier: Apache-2.0
# The manual pages that `./run docs` makes are installed if they are there.
install(DIRECTORY ${CMAKE_CURRENT_SOURCE_DIR}/build/man/
    DESTINATION ${CMAKE_INSTALL_MANDIR}
    COMPONENT documentation
    OPTIONAL
    FILES_MATCHING PATTERN "*.[357]")
