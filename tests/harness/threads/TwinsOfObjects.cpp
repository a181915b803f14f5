// SPDX-License-Identifier: Apache-2.0
// Objects, handlers, filters, messages and classes, as class functions use them.
#include "Twins.h"

namespace zelvo_test {

namespace {

/// Sets properties of each type and reads them back: nobody else can be there in between.
void useProperties(ZlvObject *object, unsigned turn)
{
    const auto number = static_cast<int32_t>(turn % 1000);
    ZlvBool found = 0;
    TWIN(zlvIntlSetObjProp)(object, "text", "value");
    HOLDS(isText(TWIN(zlvIntlGetObjProp)(object, "text", nullptr), "value"));
    TWIN(zlvIntlSetObjPropBool)(object, "truth", 1);
    HOLDS(TWIN(zlvIntlGetObjPropBool)(object, "truth", &found) == 1 && found == 1);
    TWIN(zlvIntlSetObjPropInt)(object, "number", number);
    HOLDS(TWIN(zlvIntlGetObjPropInt)(object, "number", &found) == number);
    TWIN(zlvIntlSetObjPropLong)(object, "number", number + 1);
    HOLDS(TWIN(zlvIntlGetObjPropLong)(object, "number", &found) == number + 1);
    TWIN(zlvIntlSetObjPropFloat)(object, "number", 0.5F);
    HOLDS(TWIN(zlvIntlGetObjPropFloat)(object, "number", &found) == 0.5F);
    TWIN(zlvIntlSetObjPropDouble)(object, "number", 0.25);
    HOLDS(TWIN(zlvIntlGetObjPropDouble)(object, "number", &found) == 0.25);
}

template <class Iterator>
size_t lengthOf(Iterator names, ZlvBool (*hasNext)(Iterator), Iterator (*next)(Iterator))
{
    size_t length = 0;
    for (; hasNext(names) == 1; names = next(names))
        ++length;
    return length;
}

size_t countNames(StringGroupIterator names)
{
    return lengthOf(names, TWIN(zlvIntlStringGroupIterHasNext), TWIN(zlvIntlStringGroupIterNext));
}

} // namespace

void useObjects(unsigned turn)
{
    const std::string name = "busy.object" + std::to_string(turn % 3);
    ZlvObject *object = TWIN(zlvIntlGetObject)(name.c_str(), "zlv_levelfilter");
    HOLDS(object != nullptr);
    TWIN(zlvIntlReleaseObject)(TWIN(zlvIntlAcquireObject)(object));
    HOLDS(isText(TWIN(zlvIntlGetObjectName)(object), name.c_str()));
    HOLDS(TWIN(zlvIntlGetObjectDesc)(object) == nullptr);
    const ZlvBool enabled = turn % 2;
    TWIN(zlvIntlSetObjectEnabled)(object, enabled);
    HOLDS(TWIN(zlvIntlIsObjectEnabled)(object) == enabled);
    useProperties(object, turn);
    TWIN(zlvIntlReleaseObject)(object);
}

void useListeners(unsigned turn)
{
    ZlvObject *object = TWIN(zlvIntlGetObject)("busy.filter", "zlv_levelfilter");
    const std::string name = "busy.listener" + std::to_string(turn % 3);
    ZlvObject *listener = TWIN(zlvIntlGetObject)(name.c_str(), "quiet_handler");
    TWIN(zlvIntlAddListener)(object, listener);
    bool found = false;
    for (ListenerGroupIterator at = TWIN(zlvIntlGetListeners)(object);
         TWIN(zlvIntlListenerGroupIterHasNext)(at) == 1;
         at = TWIN(zlvIntlListenerGroupIterNext)(at)) {
        ZlvObject *each = TWIN(zlvIntlListenerGroupIterGet)(at);
        found = found || each == listener;
        TWIN(zlvIntlReleaseObject)(each);
    }
    HOLDS(found);
    TWIN(zlvIntlRemListener)(object, listener);
    TWIN(zlvIntlReleaseObject)(listener);
    TWIN(zlvIntlReleaseObject)(object);
}

void useHandlers(ZlvObject *handler, ZlvEvent *event, va_list args)
{
    ZlvObject *formatter = TWIN(zlvIntlHandlerGetFormatter)(handler);
    HOLDS(formatter != nullptr);
    TWIN(zlvIntlHandlerSetFormatter)(handler, formatter);
    TWIN(zlvIntlReleaseObject)(formatter);
    HOLDS(TWIN(zlvIntlHandlerGetFmtHeader)(handler) == nullptr);
    HOLDS(TWIN(zlvIntlHandlerGetFmtTrailer)(handler) == nullptr);
    UChar *text = TWIN(zlvIntlUHandlerDoFmt)(handler, event, args);
    HOLDS(text != nullptr);
    RkoMemoryFree(text);
}

void useFilters(ZlvObject *filter, ZlvEvent *event, va_list args)
{
    ZlvObject *byLevel = TWIN(zlvIntlGetObject)("twins.bylevel", "zlv_levelfilter");
    HOLDS(byLevel != filter);
    HOLDS(TWIN(zlvIntlIsLoggableByFilter)(byLevel, event, args) == 1);
    TWIN(zlvIntlReleaseObject)(byLevel);
    HOLDS(TWIN(zlvIntlLogVA)(ZLV_LEVEL_INFO, BUNDLE, "plain").type == CX_STATUS_OK);
}

void useMessages(va_list args)
{
    ZlvI18Msg *message = TWIN(zlvIntlAllocUI18Msg)(nullptr, nullptr, u"text without arguments");
    ZlvI18Msg *copy = TWIN(zlvIntlCopyI18Msg)(message);
    TWIN(zlvIntlFreeI18Msg)(message);
    UChar *text = TWIN(zlvIntlBindUI18Msg)(copy, args);
    HOLDS(text != nullptr);
    RkoMemoryFree(text);
    TWIN(zlvIntlFreeI18Msg)(copy);
}

void useClasses(unsigned turn)
{
    const std::string name = "twins.class" + std::to_string(turn % 20);
    TWIN(zlvIntlAddLoggerClass)
    (name.c_str(), nullptr, nullptr, nullptr, nullptr, nullptr);
    TWIN(zlvIntlAddFilterClass)
    ((name + "f").c_str(), nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    TWIN(zlvIntlAddHandlerClass)
    ((name + "h").c_str(), nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    TWIN(zlvIntlAddUFormatterClass)
    ((name + "u").c_str(), nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    HOLDS(countNames(TWIN(zlvIntlGetLoggerClasses)()) > 2);
    HOLDS(countNames(TWIN(zlvIntlGetFilterClasses)()) > 2);
    HOLDS(countNames(TWIN(zlvIntlGetHandlerClasses)()) > 3);
    HOLDS(countNames(TWIN(zlvIntlGetFormatterClasses)()) > 3);
}

} // namespace zelvo_test
