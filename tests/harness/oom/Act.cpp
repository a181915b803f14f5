// SPDX-License-Identifier: Apache-2.0
#include "Act.h"

#include <fstream>

#include "World.h"

namespace zelvo_test {

void Stage::open(const std::string &properties)
{
    std::ofstream("act.properties") << properties;
    newOutput();
    ZlvOpenToolkit("act.properties", nullptr);
}

void Stage::close()
{
    for (ZlvObject *object : held_)
        ZlvReleaseObject(object);
    ZlvCloseToolkit();
    isStruckElsewhere_ = failed_() > failuresInCalls_;
    files_ = allFiles();
    removeFiles();
}

ZlvObject *Stage::get(const char *name, const char *className)
{
    held_.push_back(ZlvGetObject(name, className));
    return held_.back();
}

std::string Stage::newText()
{
    return newOutput();
}

} // namespace zelvo_test
