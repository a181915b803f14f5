// SPDX-License-Identifier: Apache-2.0
// Feeds patterns and arguments to the translation information of XML records and to binding.
//
// The first byte of an input chooses the values of the arguments, the others are the pattern. The
// caller of a logging call passes what ICU reads when it binds the message, so the argument list
// made here holds exactly that, by ICU's own parser: one slot for each argument and none behind.
// Whoever reads an argument with another type, or one too many, is caught: by the comparison below
// or by the address sanitizer.
#include "ZlvEvent.h"
#include "ZlvIntl.h"
#include "ZlvPDXMLFormatter.h"
#include "support/Arguments.h"
#include "support/Fuzz.h"
#include "support/OneBundle.h"
#include "util/CxOwned.h"

using namespace zelvo;
using namespace zelvo_fuzz;

namespace {

/// What is read of the list must be there, and of the type that ICU reads.
void compare(const ArgKinds &fetched, const Kinds &passed)
{
    for (size_t i = 0; i < ArgKinds::COUNT && fetched.of[i] != ArgKind::ABSENT; ++i)
        check(i < passed.size() - (faultIsSeeded() ? 1 : 0) && fetched.of[i] == passed[i],
              "an argument is read with the type that ICU reads");
}

void writeAndBind(ZlvEvent *event, va_list args, bool binds)
{
    CxUStringBuff out{};
    zlvPDXMLEmitUTranslationInfo(&out, event, args);
    const OwnedUStr element{CxUStringBuffTakeUStr(&out)};
    check(bool(element), "an event with a bundle has translation information");
    if (binds)
        RkoMemoryFree(zlvIntlBindUI18Msg(event->message, args));
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    if (size == 0)
        return 0;
    Input input(data, size);
    const unsigned choice = input.byte();
    const std::u16string pattern = patternOf(input.rest());
    setBundlePattern(pattern);
    Kinds readByIcu;
    if (kindsByIcu(pattern, readByIcu))
        compare(fetchableKinds(pattern.c_str()), readByIcu);

    const std::vector<uint64_t> slots = slotsOf(kindsToPass(pattern), choice);
    ZlvEvent *event =
        ZlvVaAllocUEvent(ZLV_LEVEL_NONE, "bundle", bundleKey().c_str(), nullptr, nullptr);
    writeAndBind(event, nullptr, false);
    withList(slots,
             [&](va_list list) { writeAndBind(event, list, slots.size() <= MOST_ARGUMENTS); });
    ZlvFreeEvent(event);
    return 0;
}
