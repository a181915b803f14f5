// SPDX-License-Identifier: Apache-2.0
// The reader of properties files: feeds the bytes of a file to the handler of the current state.
#include "ZlvReadPropsIntl.h"

#include <fcntl.h>
#include <iterator>

#include "CxFile.h"
#include "ZlvIntl.h"
#include "ZlvMisc.h"

namespace {

using Context = ZlvReadPropsContext;
using Handler = int32_t (*)(char c, Context *context);

constexpr Handler HANDLERS[] = {
    nullptr,
    zlvRdprDoStartLineState,
    zlvRdprDoStartLineBlanksState,
    zlvRdprDoCommentLineState,
    zlvRdprDoKeyCharsState,
    zlvRdprDoKeyCharEscapeState,
    zlvRdprDoKeyEndBlanksFirstState,
    zlvRdprDoKeyEndBlanksFinalState,
    zlvRdprDoValCharsState,
    zlvRdprDoValEscapeState,
    zlvRdprDoMultiLineValState,
    zlvRdprDoUU0State,
    zlvRdprDoUU1State,
    zlvRdprDoUU2State,
    zlvRdprDoUU3State,
    nullptr,
    nullptr,
};
static_assert(std::size(HANDLERS) == ZLV_RDPR_ERROR + 1);

/// A file with the bytes that are read ahead of the machine.
struct Input {
    CxFile file;
    size_t next;
    size_t count;
    char bytes[4096];
};

bool failed(CxStatus status, CxStatus *error)
{
    if (status.type == CX_STATUS_OK)
        return false;
    ZlvReportPlatformErr(status.type, status.code);
    if (error != nullptr)
        *error = status;
    return true;
}

CxStatus fill(Input &input)
{
    input.next = 0;
    return CxFileRead(&input.file, input.bytes, sizeof input.bytes, &input.count);
}

/// At the end of input the entry that is pending is emitted; so is once more, harmlessly, one that
/// its own line end has emitted already, unless another line followed.
int32_t finish(Context &context)
{
    const bool isComplete = context.key.length == 0 || zlvRdprEmitCfg(&context);
    return isComplete ? ZLV_RDPR_DONE : ZLV_RDPR_ERROR;
}

bool isLineEnd(char c)
{
    return c == '\n' || c == '\r';
}

int32_t handle(int32_t state, char previous, char current, Context &context)
{
    // Of adjacent line ends only the first counts: pairs of CR and LF, and empty lines.
    if (isLineEnd(previous) && isLineEnd(current))
        return state;
    return HANDLERS[state](current, &context);
}

int32_t run(Input &input, Context &context, CxStatus *error)
{
    int32_t state = ZLV_RDPR_START_LINE;
    for (char current = '\0'; state < ZLV_RDPR_DONE; ++input.next) {
        if (input.next == input.count) {
            const CxStatus status = fill(input);
            if (input.count == 0)
                return finish(context);
            if (failed(status, error))
                return ZLV_RDPR_ERROR;
        }
        const char previous = current;
        current = input.bytes[input.next];
        state = handle(state, previous, current, context);
    }
    return state;
}

} // namespace

ZlvBool zlvDoReadProps(const char *path, CxPropList *target, CxStatus *error)
{
    Input input = {};
    if (failed(CxFileOpen(&input.file, path, O_RDONLY), error))
        return false;
    Context context = {};
    context.target = target;
    const int32_t state = run(input, context, error);
    CxStringBuffDiscard(&context.key);
    CxStringBuffDiscard(&context.value);
    failed(CxFileClose(&input.file), error);
    return state == ZLV_RDPR_DONE;
}

// Stands here and not with the list, which knows nothing of the reader above it.
ZlvBool CxPropListRead(const char *fileName, CxPropList *list, CxStatus *error)
{
    return list != nullptr ? zlvDoReadProps(fileName, list, error) : ZlvBool{0};
}
