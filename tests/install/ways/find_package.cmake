# SPDX-License-Identifier: Apache-2.0
find_package(zelvo ${ZELVO_VERSION} REQUIRED)
