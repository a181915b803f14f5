// SPDX-License-Identifier: Apache-2.0
// A call that is tried with each of its allocations failing, and what is known of it.
#pragma once

#include <functional>
#include <string>
#include <tuple>
#include <type_traits>
#include <vector>

#include "Heap.h"
#include "Text.h"
#include "World.h"

namespace zelvo_test {

/// Whose a pointer is that a call answers with.
enum class Owner { CALLER, CALLEE };

struct Case {
    std::string name; ///< the call; a variant of it follows behind a blank
    Kind kind = Kind::Logger;
    bool inWorld = true; ///< else the toolkit is closed, and RUN gets no world
    std::function<void(World *)> prepare{};
    std::function<std::string(World *, Fault &)> run{};
    std::string nothing{};    ///< the answer when the call fails
    bool mayCut = false;      ///< what is printed may lack pieces
    bool isComposite = false; ///< made of many steps, of which some may fail and others not
    int64_t keeps = 0;        ///< blocks that the call leaves allocated on purpose

    /// The name of the call alone.
    std::string call() const { return name.substr(0, name.find(' ')); }
};

inline void letGo(char *text)
{
    RkoMemoryFree(text);
}
inline void letGo(UChar *text)
{
    RkoMemoryFree(text);
}
inline void letGo(void *block)
{
    RkoMemoryFree(block);
}
void letGo(ZlvObject *object);
void letGo(ZlvObjCfg *cfg);
void letGo(ZlvObjClass *objClass);
void letGo(ZlvEvent *event);
void letGo(ZlvI18Msg *message);
void letGo(ZlvParm *parm);
void letGo(StringList *list);
void letGo(ParmList *list);
void letGo(StringGroup *group);
void letGo(ListenerGroup *group);
void letGo(StringToStringMap *map);
void letGo(StringToObjMap *map);
void letGo(StringToObjCfgMap *map);
void letGo(StringToObjClassMap *map);

/// Runs CALL under a fault; its answer as text.
template <Owner OWNER = Owner::CALLER, class Call>
std::string answerOf(Fault &fault, Call call)
{
    using Result = decltype(call());
    if constexpr (std::is_void_v<Result>) {
        fault.during(call);
        return "";
    } else {
        Result result = fault.during(call);
        const std::string text = textOf(result);
        if constexpr (std::is_pointer_v<Result> && OWNER == Owner::CALLER)
            letGo(result);
        return text;
    }
}

/// The answer of a call of this result type that could not do anything.
template <class Result>
std::string nothingOf()
{
    if constexpr (std::is_void_v<Result>)
        return "";
    else if constexpr (std::is_same_v<Result, ZlvStatus>)
        return textOf(ZlvStatus{CX_STATUS_OK, 0, 0});
    else
        return textOf(Result{});
}

/// FUNCTION with samples of its own parameters.
template <Owner OWNER = Owner::CALLER, class Result, class... Parameters>
Case plainCase(const char *name, Kind kind, Result (*function)(Parameters...))
{
    Case plain{.name = name, .kind = kind};
    plain.nothing = nothingOf<Result>();
    plain.run = [function](World *world, Fault &fault) {
        std::tuple<Parameters...> arguments{world->sample<Parameters>()...};
        return answerOf<OWNER>(fault, [&] { return std::apply(function, arguments); });
    };
    return plain;
}

/// CALL(world), which captures nothing that could be lost, in a world prepared by PREPARE(world).
template <Owner OWNER = Owner::CALLER, class Call>
Case specialCase(const char *name, Kind kind, Call call, std::function<void(World *)> prepare = {})
{
    Case special{.name = name, .kind = kind, .prepare = std::move(prepare)};
    special.nothing = nothingOf<decltype(call(std::declval<World &>()))>();
    special.run = [call](World *world, Fault &fault) {
        return answerOf<OWNER>(fault, [&] { return call(*world); });
    };
    return special;
}

/// The same, made of many steps.
inline Case composite(Case call)
{
    call.isComposite = true;
    return call;
}

using Cases = std::vector<Case>;

inline void append(Cases &cases, const Cases &more)
{
    cases.insert(cases.end(), more.begin(), more.end());
}

/// The calls of the portability layer, the containers and the toolkit.
void addPortabilityCases(Cases &cases);
void addContainerCases(Cases &cases);
void addPropertyCases(Cases &cases);
void addObjectCases(Cases &cases);
void addConfigurationCases(Cases &cases);
void addEventCases(Cases &cases);
void addRecordCases(Cases &cases);
void addFileCases(Cases &cases);
void addCrowdCases(Cases &cases);
void addClosedCases(Cases &cases);
/// Calls with a fault in each, which have to be found.
void addFaultyCases(Cases &cases);

} // namespace zelvo_test
