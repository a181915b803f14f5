# SPDX-License-Identifier: Apache-2.0
add_subdirectory(${ZELVO_SOURCE} zelvo)
