// SPDX-License-Identifier: Apache-2.0
// The localised name that files by descriptor and files by name hand to the platform.
#pragma once

#include "CxFile.h"

namespace zelvo {

/// A file name with '/' alone.
struct LocalName {
    char text[CX_FILE_NAME_SIZE];
};

/// Localises a name; an absent one gives 'p'/22, one that does not fit 'p'/36.
CxStatus localName(const char *name, LocalName &local);

} // namespace zelvo
