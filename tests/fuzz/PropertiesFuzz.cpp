// SPDX-License-Identifier: Apache-2.0
// Feeds files to the reader of properties, which reads them into a list and into configurations.
// The first byte of an input is the size of the pieces in which the file is read, zero for as large
// as may be; the others are the file.
#include "CxFile.h"
#include "CxPropList.h"
#include "ZlvIntl.h"
#include "ZlvOwned.h"
#include "support/Fuzz.h"
#include "support/MemoryFile.h"
#include "support/PropertiesModel.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::OwnedStr;

namespace {

size_t pieceSize;

bool isUntouched(const CxStatus &error)
{
    return error.type == 'x' && error.code == -7;
}

void checkList(const char *name, const PropertiesInList &expected)
{
    CxPropList list{};
    CxStatus error{'x', -7};
    check((CxPropListRead(name, &list, &error) == 1) == expected.isComplete,
          "a list is complete when the file has no fault");
    check(isUntouched(error), "a fault of syntax is no platform error");
    check(static_cast<size_t>(list.count) == expected.entries.size(), "a list has as many entries");
    CxPropListIter at = CxPropListIterator(&list);
    for (const auto &[key, value] : expected.entries) {
        check(key == CxPropListIterPeekKey(&at), "keys come in the order of the file");
        check(value == CxPropListIterPeekVal(&at), "the last value of a key counts");
        CxPropListIterNext(&at);
    }
    CxPropListDiscard(&list);
}

/// Configurations know no parent but one whose name begins theirs.
void checkParent(ZlvObjCfg *config, const std::string &name)
{
    const zelvo::CfgRef parent{zlvIntlObjCfgGetParent(config)};
    if (!parent)
        return;
    const OwnedStr parentName{zlvIntlObjCfgGetName(parent.get())};
    check(parentName && name.starts_with(std::string(parentName.get()) + "."),
          "a parent's name is the start of its child's");
    check(zlvIntlLogMgrHasCfg(parentName.get()) == 1, "a parent is registered");
}

void checkConfig(const std::string &name, const PropertiesInConfigs::Properties &expected)
{
    const zelvo::CfgRef config{zlvIntlLogMgrGetCfg(name.c_str())};
    check(zlvIntlObjCfgIsFromFile(config.get()) == 1, "a configuration knows that a file made it");
    StringToStringMapIterator at = zlvIntlObjCfgProperties(config.get());
    for (const auto &[property, value] : expected) {
        const OwnedStr foundProperty{zlvIntlStringToStringMapIterGetKey(at)};
        const OwnedStr foundValue{zlvIntlStringToStringMapIterGetVal(at)};
        check(foundProperty && property == foundProperty.get(), "properties keep their order");
        check(foundValue && value == foundValue.get(), "the last value of a property counts");
        at = zlvIntlStringToStringMapIterNext(at);
    }
    check(zlvIntlStringToStringMapIterHasNext(at) == 0, "a configuration has no more properties");
    checkParent(config.get(), name);
}

void checkConfigs(const char *name, const PropertiesInConfigs &expected)
{
    const zelvo::ApiLock lock;
    zlvInitLogMgr();
    CxStatus error{'x', -7};
    check((zlvDoReadProps(name, nullptr, &error) == 1) == expected.isComplete,
          "configurations are complete when the file has no fault");
    check(isUntouched(error), "a fault of a key is no platform error");
    StringGroupIterator at = zlvIntlLogMgrConfigNames();
    for (const auto &[config, properties] : expected.configs) {
        const OwnedStr found{zlvIntlStringGroupIterGet(at)};
        check(found && config == found.get(), "configurations keep their order");
        checkConfig(config, properties);
        at = zlvIntlStringGroupIterNext(at);
    }
    check(zlvIntlStringGroupIterHasNext(at) == 0, "there are no more configurations");
    zlvCloseLogMgr();
}

} // namespace

// The name is the linker's: this stands between the reader and the file.
// NOLINTBEGIN(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)
extern "C" {
CxStatus __real_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count);
CxStatus __wrap_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count);

CxStatus __wrap_CxFileRead(CxFile *file, void *buffer, size_t length, size_t *count)
{
    return __real_CxFileRead(file, buffer, pieceSize == 0 ? length : std::min(length, pieceSize),
                             count);
}
}
// NOLINTEND(bugprone-reserved-identifier, cert-dcl37-c, cert-dcl51-cpp)

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    static const MemoryFile file;
    Input input(data, size);
    pieceSize = input.byte();
    file.hold(input.rest());
    const PropertiesReading reading = readProperties(input.rest());
    checkList(file.name(), propertiesInList(reading));
    checkConfigs(file.name(), propertiesInConfigs(reading));
    return 0;
}
