// SPDX-License-Identifier: Apache-2.0
// Feeds properties files to the whole toolkit: opens it, makes every object that the file
// describes, logs through the loggers among them, and closes it. All of that twice: the second life
// must leave what the first one left. An input is a properties file.
#include <algorithm>
#include <set>

#include "ZlvFileHandler.h"
#include "ZlvIntl.h"
#include "ZlvLevel.h"
#include "ZlvLogger.h"
#include "ZlvObject.h"
#include "ZlvOwned.h"
#include "ZlvToolkitIntl.h"
#include "support/Defaults.h"
#include "support/Fuzz.h"
#include "support/Life.h"
#include "support/MemoryFile.h"
#include "support/OneBundle.h"
#include "support/PropertiesModel.h"
#include "util/CxOwned.h"

using namespace zelvo_fuzz;
using zelvo::OwnedStr;

namespace {

using Config = std::pair<std::string, PropertiesInConfigs::Properties>;
using Configs = std::vector<Config>;

/// An event takes each way through the listeners that visits none of them twice, so their number
/// grows faster than anything else in a file.
constexpr size_t MOST_LISTENERS = 4;
constexpr size_t MOST_LOGGERS = 4;
constexpr size_t MOST_CONFIGS = 24;

/// A rollover shifts as many files as it may keep, whether or not they are there.
constexpr int32_t MOST_FILES = 5;

struct BuiltinClass {
    std::string_view name;
    int32_t kind;
    bool hasLevel;
};

constexpr BuiltinClass classes[] = {
    {"zlv_basiclogger", ZLV_KIND_LOGGER, true},
    {"zlv_pdlogger", ZLV_KIND_LOGGER, true},
    {"zlv_levelfilter", ZLV_KIND_FILTER, true},
    {"zlv_msgidfilter", ZLV_KIND_FILTER, false},
    {"zlv_consolehandler", ZLV_KIND_HANDLER, false},
    {"zlv_filehandler", ZLV_KIND_HANDLER, false},
    {"zlv_multiproc_filehandler", ZLV_KIND_HANDLER, false},
    {"zlv_basicformatter", ZLV_KIND_FORMATTER, false},
    {"zlv_xmlformatter", ZLV_KIND_FORMATTER, false},
    {"zlv_vyxtraceformatter", ZLV_KIND_FORMATTER, false},
};

const std::string *valueIn(const Config &config, std::string_view property)
{
    for (const auto &[name, value] : config.second)
        if (name == property)
            return &value;
    return nullptr;
}

size_t listenersIn(const Configs &configs)
{
    std::set<std::string> names;
    for (const Config &config : configs) {
        const std::string *value = valueIn(config, "listenerNames");
        std::string name;
        for (const char c : value != nullptr ? *value + " " : "") {
            if (std::string_view(" \t\r\n\f\v").find(c) == std::string_view::npos)
                name += c;
            else
                names.insert(std::exchange(name, ""));
        }
    }
    names.erase("");
    return names.size();
}

/* What the file says of an object must be true of it. */

/// The toolkit makes some objects itself, of a class of its own choice.
bool isMadeByToolkit(const std::string &name)
{
    return name == "msgFormatter" || name == "zelvo.pdMsgIdFormatter" ||
           name == "zelvo.errorLogger" || name == "zelvo.defaultConsole" ||
           name == "zelvo.defaultFormatter";
}

void checkLevel(const ZlvObject *object, const std::string &value)
{
    const ZlvLevel level = ZlvGetLevelFromString(value.c_str());
    const ZlvLevel found =
        object->objClass->kind == ZLV_KIND_LOGGER ? object->logger.level : object->filter.level;
    check(found == level + (faultIsSeeded() ? 1 : 0), "an object has the level that is configured");
}

void checkClass(const ZlvObject *object, const Config &config)
{
    const std::string *className = valueIn(config, "className");
    if (className == nullptr || isMadeByToolkit(config.first))
        return;
    const auto *found = std::find_if(std::begin(classes), std::end(classes),
                                     [&](const auto &one) { return one.name == *className; });
    check((object != nullptr) == (found != std::end(classes)), "an object is of a class there is");
    if (object == nullptr)
        return;
    check(*className == object->objClass->name, "an object is of the class that is configured");
    const std::string *level = valueIn(config, "level");
    if (found->hasLevel && level != nullptr)
        checkLevel(object, *level);
}

void checkProperties(ZlvObject *object, const Config &config)
{
    for (const auto &[property, value] : config.second) {
        const OwnedStr found{ZlvGetObjProp(object, property.c_str(), nullptr)};
        check(found && value == found.get(), "an object has the properties of its configuration");
    }
}

/* Life. */

ZlvObject *madeFrom(const Config &config)
{
    ZlvObject *object = ZlvGetObject(config.first.c_str(), nullptr);
    checkClass(object, config);
    if (object != nullptr)
        checkProperties(object, config);
    return object;
}

bool hasClass(const ZlvObject *object, std::string_view name)
{
    return object != nullptr && name == object->objClass->name;
}

void keepFewFiles(ZlvObject *object)
{
    if (!hasClass(object, "zlv_filehandler") && !hasClass(object, "zlv_multiproc_filehandler"))
        return;
    if (static_cast<const FileHandlerVars *>(object->vars)->maxFiles > MOST_FILES)
        ZlvSetObjPropInt(object, "maxFiles", MOST_FILES);
}

/// Listeners exist that no line of the file is about: they inherit.
void keepFewFilesOfAll()
{
    StringToObjMapIterator at = zlvIntlStringToObjMapIterator(ZLV_TK_INSTANCES);
    for (; zlvIntlStringToObjMapIterHasNext(at) != 0; at = zlvIntlStringToObjMapIterNext(at)) {
        const zelvo::ObjectRef object{zlvIntlStringToObjMapIterGetVal(at)};
        keepFewFiles(object.get());
    }
}

void log(ZlvObject *logger, std::vector<ZlvStatus> &results)
{
    results.push_back(ZlvLogUText(logger, u"ABC1234E {0}, {1,number,integer}", u"Tee", 3));
    results.push_back(ZlvLogWarn(logger, "shop", "opened", u"Zo\u00EB", 98765.432));
    results.push_back(ZlvLogDebugMin(logger, "till.c", "open", 12, u"plain"));
    results.push_back(ZlvLogError(logger, "shop", "opened", u"]]>\n", -0.5));
}

void logThrough(const std::vector<ZlvObject *> &objects, std::vector<ZlvStatus> &results)
{
    size_t loggers = 0;
    for (ZlvObject *object : objects)
        if (object != nullptr && object->objClass->kind == ZLV_KIND_LOGGER &&
            loggers++ < MOST_LOGGERS)
            log(object, results);
}

std::vector<ZlvStatus> liveThrough(const Configs &configs)
{
    std::vector<ZlvObject *> objects;
    for (const Config &config : configs)
        objects.push_back(madeFrom(config));
    keepFewFilesOfAll();
    std::vector<ZlvStatus> results;
    logThrough(objects, results);
    for (const ZlvStatus &result : results)
        check(result.type == CX_STATUS_OK ? result.code == 0 : result.type == CX_STATUS_PLATFORM,
              "a logging call succeeds, or says what failed");
    std::for_each(objects.begin(), objects.end(), ZlvReleaseObject);
    return results;
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    static const MemoryFile file;
    static const bool isSetUp = (setDefaults(), true);
    const std::string_view text = Input(data, size).rest();
    const PropertiesInConfigs expected = propertiesInConfigs(readProperties(text));
    if (!isSetUp || expected.configs.size() > MOST_CONFIGS ||
        listenersIn(expected.configs) > MOST_LISTENERS)
        return 0;
    setBundlePattern(u"{0} bought tea for {1,number}");
    file.hold(text);
    const auto body = [&] { return liveThrough(expected.configs); };
    const Traces first = live(file.name(), body);
    check(first.opened == expected.isComplete, "the toolkit opens when the file has no fault");
    check(live(file.name(), body) == first, "a second life leaves what the first one left");
    return 0;
}
