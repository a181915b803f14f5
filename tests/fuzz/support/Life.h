// SPDX-License-Identifier: Apache-2.0
// One life of the toolkit in the scratch directory, with a clock and a host name of its own, and
// what it leaves behind: records on the console, files, results of logging calls.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "ZlvLogger.h"

namespace zelvo_fuzz {

struct Traces {
    bool opened;
    std::vector<ZlvStatus> results;
    std::string console;
    std::map<std::string, std::string> files;
};

bool operator==(const Traces &a, const Traces &b);

/// Opens the toolkit with a properties file; if that succeeds, has BODY log and give the results.
/// Then closes it and makes sure that it keeps nothing.
Traces live(const char *propertiesFile, const std::function<std::vector<ZlvStatus>()> &body);

} // namespace zelvo_fuzz
