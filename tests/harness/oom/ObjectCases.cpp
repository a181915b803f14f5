// SPDX-License-Identifier: Apache-2.0
// Classes, objects, their listeners and what their properties do.
#include "PlainCase.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

/// Both forms of a call that gets nothing from the world.
#define CALLED(call, ...)                                                                          \
    specialCase("Zlv" #call, Kind::Logger, [](World &) { return Zlv##call(__VA_ARGS__); }),        \
        specialCase("zlvIntl" #call, Kind::Logger,                                                 \
                    [](World &) { return zlvIntl##call(__VA_ARGS__); })

const ZlvI18Msg *description()
{
    static char bundle[] = "bundle";
    static char key[] = "key";
    static const ZlvI18Msg message{bundle, key, nullptr, nullptr, nullptr, 0};
    return &message;
}

void addClasses(Cases &cases)
{
    append(cases, {CALLED(AddLoggerClass, "own", description(), nullptr, nullptr, nullptr, nullptr),
                   CALLED(AddFilterClass, "own", nullptr, nullptr, nullptr, nullptr, nullptr,
                          nullptr, nullptr),
                   CALLED(AddHandlerClass, "own", nullptr, nullptr, nullptr, nullptr, nullptr,
                          nullptr, nullptr),
                   CALLED(AddUFormatterClass, "own", nullptr, nullptr, nullptr, nullptr, nullptr,
                          nullptr, nullptr, nullptr),
                   specialCase("zlvInitObjectClass", Kind::Logger,
                               [](World &) {
                                   return zlvInitObjectClass("own", ZLV_KIND_LOGGER, description(),
                                                             nullptr, nullptr, nullptr);
                               }),
                   specialCase("zlvToolkitAddClassDef", Kind::Logger, [](World &) {
                       zlvToolkitAddClassDef("own",
                                             zlvInitObjectClass("own", ZLV_KIND_FILTER, nullptr,
                                                                nullptr, nullptr, nullptr));
                   })});
}

/// Getting a new object of a class.
Case newObject(const char *className)
{
    Case creation{.name = std::string("ZlvGetObject ") + className};
    creation.nothing = "null";
    creation.isComposite = true;
    creation.run = [className](World *, Fault &fault) {
        return answerOf(fault, [&] { return ZlvGetObject("new", className); });
    };
    return creation;
}

/// Describes an object "made" of a class in a configuration, and one that it inherits from.
void describe(const char *className, const char *property, const char *value)
{
    for (const char *name : {"made", "made.of.parts"}) {
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(name);
        ZlvSetObjCfgProp(cfg, "className", className);
        ZlvSetObjCfgProp(cfg, property, value);
        ZlvReleaseObjCfg(cfg);
    }
}

void addCreation(Cases &cases)
{
    for (const char *className :
         {"zlv_basiclogger", "zlv_pdlogger", "zlv_levelfilter", "zlv_msgidfilter",
          "zlv_consolehandler", "zlv_filehandler", "zlv_multiproc_filehandler",
          "zlv_basicformatter", "zlv_xmlformatter", "zlv_vyxtraceformatter"})
        cases.push_back(newObject(className));
    Cases calls{
        CALLED(GetObject, "made.of.parts", nullptr),
        specialCase("zlvToolkitAddObjInstance", Kind::Logger,
                    [](World &world) { zlvToolkitAddObjInstance("alias", world.object()); }),
        PAIR(GetObjectName),
    };
    for (Case &call : calls) {
        call.isComposite = true;
        call.prepare = [](World *) { describe("zlv_levelfilter", "level", "WARN"); };
    }
    append(cases, calls);
}

/// Setting a property that does more than being stored.
Case setting(Kind kind, const char *property, const char *value)
{
    Case call{.name = std::string("ZlvSetObjProp ") + property, .kind = kind};
    call.isComposite = true;
    call.run = [=](World *world, Fault &fault) {
        return answerOf(fault, [&] { ZlvSetObjProp(world->object(), property, value); });
    };
    call.prepare = [](World *) {
        describe("zlv_levelfilter", "level", "WARN");
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg("format");
        ZlvSetObjCfgProp(cfg, "className", "zlv_basicformatter");
        ZlvReleaseObjCfg(cfg);
    };
    return call;
}

void addSettings(Cases &cases)
{
    append(cases, {setting(Kind::Logger, "listenerNames", "made made.of.parts unknown"),
                   setting(Kind::Logger, "level", "INFO"),
                   setting(Kind::Logger, "logging", "off"),
                   setting(Kind::Handler, "formatterName", "format"),
                   setting(Kind::Formatter, "separator", ";"),
                   setting(Kind::Formatter, "dateTimeFormat", "HH"),
                   setting(Kind::Formatter, "locale", "de"),
                   setting(Kind::FileHandler, "fileName", "logs/app7.log"),
                   setting(Kind::FileHandler, "fileEncoding", "UTF-8"),
                   setting(Kind::FileHandler, "maxFileBytes", "100"),
                   setting(Kind::FileHandler, "maxFiles", "4"),
                   setting(Kind::FileHandler, "appending", "false"),
                   setting(Kind::FileHandler, "filePermission", "640"),
                   setting(Kind::FileHandler, "logInternalErrs", "true"),
                   setting(Kind::SharedFileHandler, "MPFileSemKey", "7"),
                   setting(Kind::MsgIdFilter, "msgIds", "ABC* XYZ*E"),
                   setting(Kind::MsgIdFilter, "mode", "PASSTHRU"),
                   setting(Kind::MsgIdFilter, "msgIdRepeatTime", "1000"),
                   setting(Kind::PDLogger, "product", "Shop"),
                   setting(Kind::PDLogger, "server", "till.example.org"),
                   setting(Kind::XmlFormatter, "singleServer", "true")});
}

/// The entry of a class that follows a property which is there already.
#define FOLLOW(kind, entry, property)                                                              \
    specialCase(                                                                                   \
        #entry, Kind::kind, [](World &world) { entry(world.object(), property); },                 \
        [](World *world) { ZlvSetObjProp(world->object(), property, "5"); })

void addEntries(Cases &cases)
{
    Cases calls{FOLLOW(Logger, ZlvBasicLoggerFCfgChange, "level"),
                FOLLOW(Logger, ZlvBasicObjectFCfgChange, "listenerNames"),
                FOLLOW(Handler, ZlvBasicHandlerFCfgChange, "formatterName"),
                FOLLOW(Formatter, ZlvBasicFormatterFCfgChange, "separator"),
                FOLLOW(Filter, ZlvLevelFilterFCfgChange, "level"),
                FOLLOW(FileHandler, ZlvFileHandlerFCfgChange, "fileName"),
                FOLLOW(MsgIdFilter, ZlvMsgIdFilterFCfgChange, "msgIds"),
                FOLLOW(PDLogger, ZlvPDLoggerFCfgChange, "product"),
                FOLLOW(XmlFormatter, ZlvPDXMLFormatterFCfgChange, "separator"),
                FOLLOW(Logger, zlvNotifyObjCfgChange, "level")};
    for (Case &call : calls)
        call.isComposite = true;
    append(cases, calls);
}

/// The variables of a class, made and freed.
#define VARS(name)                                                                                 \
    specialCase("Zlv" #name "FAllocVars", Kind::Logger, [](World &) {                              \
        void *vars = Zlv##name##FAllocVars();                                                      \
        Zlv##name##FFreeVars(vars);                                                                \
        return ZlvBool{vars != nullptr};                                                           \
    })

void addVariables(Cases &cases)
{
    Cases calls{VARS(ConsoleHandler), VARS(FileHandler), VARS(MsgIdFilter), VARS(PDLogger),
                VARS(PDXMLFormatter)};
    for (Case &call : calls)
        call.isComposite = true;
    append(cases, calls);
}

#define LISTEN(call)                                                                               \
    specialCase(#call, Kind::Logger, [](World &world) { call(world.object(), ZLV_TK_ERROR_LOG); })

/// An object of a class with a description.
void describeClass(World *world)
{
    UChar text[] = u"text";
    const ZlvI18Msg message{nullptr, nullptr, text, nullptr, nullptr, 0};
    ZlvAddLoggerClass("described", &message, nullptr, nullptr, nullptr, nullptr);
    world->hold("described.object", "described");
}

template <class Call>
Case descriptionCase(const char *name, Call call)
{
    return specialCase(
        name, Kind::Logger, [call](World &) { return call(ZLV_TK_INSTANCES->last->value); },
        describeClass);
}

void addListeners(Cases &cases)
{
    append(cases, {descriptionCase("ZlvGetObjectDesc", ZlvGetObjectDesc),
                   descriptionCase("zlvIntlGetObjectDesc", zlvIntlGetObjectDesc)});
    append(cases,
           {LISTEN(ZlvAddListener), LISTEN(zlvIntlAddListener),
            specialCase<Owner::CALLEE>("zlvFetchListenerGroup", Kind::Handler, [](World &world) {
                return zlvFetchListenerGroup(world.object(), 1);
            })});
}

} // namespace

void addObjectCases(Cases &cases)
{
    addClasses(cases);
    addCreation(cases);
    addSettings(cases);
    addEntries(cases);
    addVariables(cases);
    addListeners(cases);
}

} // namespace zelvo_test
