# SPDX-License-Identifier: Apache-2.0
add_library(zelvo::zelvo SHARED IMPORTED)
set_target_properties(zelvo::zelvo PROPERTIES
  INTERFACE_COMPILE_OPTIONS "-Werror"
  INTERFACE_LINK_OPTIONS "LINKER:-z,now")
