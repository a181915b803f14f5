// SPDX-License-Identifier: Apache-2.0
// Classes whose functions call every zlvIntl twin while other threads use the same objects.
#pragma once

#include <cstdarg>
#include <string>
#include <vector>

#include "zelvo.h"

namespace zelvo_test {

constexpr const char *BUNDLE = ZELVO_TEST_BUNDLES "/zelvomsg";

/// Calls a twin, and notes its name for missingTwins().
#define TWIN(NAME) (zelvo_test::noteTwin(#NAME), NAME)

void noteTwin(const char *name);

/// Counts an answer that a twin should not have given. The caller holds the API mutex.
#define HOLDS(CONDITION) zelvo_test::noteAnswer(CONDITION, #CONDITION)

void noteAnswer(bool isRight, const char *claim);

/// Compares a string that a twin gave, and frees it.
bool isText(char *text, const char *expected);

/// The claims that did not hold, each once.
const std::vector<std::string> &wrongAnswers();

/// How many twins the list of exported names has, and those of them that nobody has called.
struct TwinCount {
    size_t listed = 0;
    std::vector<std::string> missing;
};
TwinCount countTwins(const char *exportsFile);

// What class functions do. TURN varies it.
void useObjects(unsigned turn);
void useListeners(unsigned turn);
void useHandlers(ZlvObject *handler, ZlvEvent *event, va_list args);
void useFilters(ZlvObject *filter, ZlvEvent *event, va_list args);
void useMessages(va_list args);
void useClasses(unsigned turn);
void useConfigurations(unsigned turn);
void useLogManager(unsigned turn);
void useLists();
void useMaps();

/// Registers the four classes and makes the tree of one object of each; gives its logger.
ZlvObject *makeTwins();

} // namespace zelvo_test
