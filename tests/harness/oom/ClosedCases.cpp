// SPDX-License-Identifier: Apache-2.0
// What can be called before the toolkit is opened.
#include <fstream>

#include "Case.h"
#include "ZlvToolkitIntl.h"

namespace zelvo_test {
namespace {

template <class Call>
Case closedCase(const char *name, Call call)
{
    Case made{.name = name, .inWorld = false, .isComposite = true};
    made.run = [call](World *, Fault &fault) { return answerOf(fault, call); };
    made.nothing = nothingOf<decltype(call())>();
    return made;
}

constexpr const char *PROPERTIES = "console.className = zlv_consolehandler\n"
                                   "zelvo.errorLogger.listenerNames = console\n"
                                   "zelvo.errorLogger.level = INFO\n";

} // namespace

void addClosedCases(Cases &cases)
{
    Case withFile = closedCase("ZlvOpenToolkit file", [] {
        CxStatus error{CX_STATUS_OK, 0};
        return ZlvOpenToolkit("sample.properties", &error);
    });
    withFile.prepare = [](World *) { std::ofstream("sample.properties") << PROPERTIES; };
    cases.push_back(withFile);
    cases.push_back(closedCase("ZlvOpenToolkit", [] { return ZlvOpenToolkit(nullptr, nullptr); }));
    cases.push_back(closedCase("zlvInitLogMgr", [] { zlvInitLogMgr(); }));
    cases.push_back(closedCase("zlvToolkitInitObjClasses", [] { zlvToolkitInitObjClasses(); }));
    cases.push_back(closedCase("ZlvAddHandlerClass early", [] {
        ZlvAddHandlerClass("own", nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    }));
}

} // namespace zelvo_test
