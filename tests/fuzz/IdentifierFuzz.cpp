// SPDX-License-Identifier: Apache-2.0
// Feeds texts to the parser of message identifiers.
#include "CxKvtID.h"
#include "support/Fuzz.h"
#include "support/Identifiers.h"

using namespace zelvo_fuzz;

namespace {

void checkFound(const CxKvtIDInfo &info, const IdentifierForm &form, const std::string &text)
{
    const size_t length = form.letters + form.digits + 1;
    const size_t code = form.letters * 100 + form.digits * 10 + 1;
    const size_t wrong = faultIsSeeded() && form.digits == 4 ? 1 : 0;
    check(std::string_view(info.format) == form.name, "the form is named");
    check(static_cast<size_t>(info.code) == code + wrong, "the code tells the counts");
    check(static_cast<size_t>(info.length) == length, "the length counts the severity too");
    check(text.substr(0, length) == info.identifier, "the identifier is copied and terminated");
    const char severity = length == 10 ? '\0' : text[length - 1];
    check(info.severity == severity, "only an identifier of ten characters hides its severity");
}

void checkNothing(const CxKvtIDInfo &info)
{
    check(*info.format == '\0' && info.code == 0 && info.length == 0, "nothing is recognised");
    check(*info.identifier == '\0' && info.severity == '\0', "nothing is copied");
}

} // namespace

int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const std::string text = Input(data, size).text();
    const CxKvtIDInfo info = CxParseKvtID(ExactText(text).get());
    const IdentifierForm *form = identifierFormOf(text);
    if (form == nullptr) {
        checkNothing(info);
        return 0;
    }
    checkFound(info, *form, text);
    checkFound(CxParseKvtID(ExactText(info.identifier).get()), *form, info.identifier);
    return 0;
}
