// SPDX-License-Identifier: Apache-2.0
// What a property does, observed from outside and put in the words of docs/properties-keys.md.
#pragma once

#include <string>

#include "Subject.h"

namespace zelvo_test {

/// Tells the setting that SUBJECT behaves by; KEY is the property.
using Observer = std::string (*)(Subject &subject, const char *key);

// Every class.
std::string classOfNewObject(Subject &subject, const char *key);
std::string isEnabled(Subject &subject, const char *key);
std::string listenersOf(Subject &subject, const char *key);

// Loggers and filters.
std::string leastLevelLogged(Subject &subject, const char *key);
std::string leastLevelPassed(Subject &subject, const char *key);
std::string stampOf(Subject &subject, const char *key);
std::string modeOf(Subject &subject, const char *key);
std::string identifiersBlocked(Subject &subject, const char *key);
std::string quietTime(Subject &subject, const char *key);

// Formatters.
std::string isWrittenOnce(Subject &subject, const char *key);
std::string isForcedAsMessage(Subject &subject, const char *key);
std::string isForcedAsTrace(Subject &subject, const char *key);
std::string separatorOfFields(Subject &subject, const char *key);
std::string separatorKept(Subject &subject, const char *key);
std::string dateWritten(Subject &subject, const char *key);
std::string localeOfNumbers(Subject &subject, const char *key);

// Handlers.
std::string formatterOf(Subject &subject, const char *key);
std::string limitOfFile(Subject &subject, const char *key);
std::string filesKept(Subject &subject, const char *key);
std::string fileWritten(Subject &subject, const char *key);
std::string isAppending(Subject &subject, const char *key);
std::string modeOfFile(Subject &subject, const char *key);
std::string modeOfDirectory(Subject &subject, const char *key);
std::string encodingKept(Subject &subject, const char *key);
std::string semaphoreKey(Subject &subject, const char *key);
std::string internalErrorsFlag(Subject &subject, const char *key);

} // namespace zelvo_test
