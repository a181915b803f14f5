# SPDX-License-Identifier: Apache-2.0
include(FetchContent)
FetchContent_Declare(zelvo SOURCE_DIR ${ZELVO_SOURCE})
FetchContent_MakeAvailable(zelvo)
