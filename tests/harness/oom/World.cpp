// SPDX-License-Identifier: Apache-2.0
#include "World.h"

namespace zelvo_test {

World::World(Kind kind, Buffers buffers) : NullCallWorld(kind)
{
    if (kind == Kind::SharedFileHandler)
        ZlvSetObjPropInt(object(), "MPFileSemKey", ownSemaphoreKey());
    if (buffers == Buffers::FULL)
        fillBuffers();
    else
        dropBuffers();
}

World::~World()
{
    for (ZlvObject *object : held_)
        ZlvReleaseObject(object);
    CxStringBuffDiscard(&context.key);
    CxStringBuffDiscard(&context.value);
    for (char *text : {fileVars.directory, fileVars.base, fileVars.extension})
        RkoMemoryFree(text);
    RkoMemoryFree(array);
}

ZlvObject *World::hold(const char *name, const char *className)
{
    held_.push_back(ZlvGetObject(name, className));
    return held_.back();
}

void World::fillBuffers()
{
    for (CxStringBuff *bytes : {sample<CxStringBuff *>(), &context.key, &context.value})
        do
            CxStringBuffAppendChar(bytes, '.');
        while (bytes->length + 1 < bytes->capacity);
    auto *units = sample<CxUStringBuff *>();
    while ((units->length + 1) * sizeof(UChar) < units->capacity)
        CxUStringBuffAppendUStr(units, u".");
    auto *props = sample<CxPropList *>();
    while (props->count + 1 < props->capacity)
        CxPropListPutStr(props, ("key" + std::to_string(props->count)).c_str(), "value");
}

void World::dropBuffers()
{
    CxStringBuffDiscard(sample<CxStringBuff *>());
    CxUStringBuffDiscard(sample<CxUStringBuff *>());
    CxPropListDiscard(sample<CxPropList *>());
}

void World::addContainers(Lines &lines)
{
    addElements(lines, "strings", sample<StringList *>());
    addElements(lines, "parms", sample<ParmList *>());
    addElements(lines, "names", sample<StringGroup *>());
    addElements(lines, "listeners", sample<ListenerGroup *>());
    addElements(lines, "texts", sample<StringToStringMap *>());
    addElements(lines, "objects", sample<StringToObjMap *>());
    addElements(lines, "cfgs", sample<StringToObjCfgMap *>());
    addElements(lines, "classes", sample<StringToObjClassMap *>());
    lines.push_back("strings count " + textOf(sample<StringList *>()->count));
    lines.push_back("parms count " + textOf(sample<ParmList *>()->count));
}

void World::addProps(Lines &lines)
{
    const auto &props = *sample<CxPropList *>();
    lines.push_back("props count " + textOf(props.count) + " of " + textOf(props.capacity));
    for (int32_t i = 0; i < props.count; ++i)
        lines.push_back("props has " + textOf(props.entries[i].key) + "=" +
                        textOf(props.entries[i].value));
}

void World::addEvent(Lines &lines)
{
    lines.push_back("event " + textOf(event()));
    lines.push_back("event id " + textOf(event()->messageId));
    lines.push_back("event locale " + textOf(event()->locale));
    lines.push_back("event status " + textOf(event()->status));
    addElements(lines, "event", event()->properties);
}

Lines World::state()
{
    Lines lines;
    addToolkitState(lines);
    addEvent(lines);
    addContainers(lines);
    addProps(lines);
    const auto add = [&](const char *name, const auto &value) {
        lines.push_back(std::string(name) + " " + textOf(value));
    };
    add("parm", sample<ZlvParm *>());
    add("bytes", *sample<CxStringBuff *>());
    add("units", *sample<CxUStringBuff *>());
    add("text", sample<char *>());
    add("found", *sample<ZlvBool *>());
    add("reader's key", context.key);
    add("reader's value", context.value);
    add("name parts", fileVars);
    add("array", array);
    add("array's capacity", arrayCapacity);
    add("array's length", arrayLength);
    return lines;
}

} // namespace zelvo_test
