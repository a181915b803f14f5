// SPDX-License-Identifier: Apache-2.0
// Opening, closing and rolling over log files, and their names.
#include "Case.h"
#include "support/LineFormatter.h"

namespace zelvo_test {
namespace {

/// A file with something in it, so that there is something to roll over.
void openWithContent(World *world)
{
    ZlvMultiProcFileHandlerFOpen(world->object());
    size_t count = 0;
    CxFileWrite(&static_cast<FileHandlerVars *>(world->object()->vars)->file, "text", 4, &count);
}

/// A handler whose formatter makes a header and a trailer.
void bindFramed(World *world)
{
    LineFormatter::addClasses();
    ZlvHandlerSetFormatter(world->object(), world->hold("framed", LineFormatter::framed));
}

/// A frame that is asked for again each time.
template <class Call>
Case frameCase(const char *name, Kind kind, Call call)
{
    Case made = composite(specialCase(name, kind, call, bindFramed));
    made.mayCut = true;
    return made;
}

#define ENTRY(kind, entry)                                                                         \
    specialCase(#entry, Kind::kind, [](World &world) { return entry(world.object()); })

} // namespace

void addFileCases(Cases &cases)
{
    Cases calls{
        ENTRY(FileHandler, ZlvFileHandlerFOpen),
        ENTRY(FileHandler, ZlvFileHandlerFOpenWithErr),
        ENTRY(FileHandler, zlvFileHandlerDoRollover),
        ENTRY(SharedFileHandler, zlvMultiProcFileHandlerDoRollover),
        ENTRY(SharedFileHandler, zlvMultiProcFileHandlerRollActiveLog),
        plainCase("zlvSetFileNameParts", Kind::Logger, zlvSetFileNameParts),
        specialCase("zlvFHGetFileNameParts", Kind::Logger,
                    [](World &world) { zlvFHGetFileNameParts("logs/app7.log", &world.fileVars); }),
    };
    for (Case &call : calls) {
        call.isComposite = true;
        call.prepare = call.kind == Kind::SharedFileHandler ? openWithContent : bindFramed;
    }
    append(cases, calls);
    append(cases, {frameCase("ZlvConsoleHandlerFOpen", Kind::Handler,
                             [](World &world) { ZlvConsoleHandlerFOpen(world.object()); }),
                   frameCase("ZlvConsoleHandlerFClose", Kind::Handler,
                             [](World &world) {
                                 ZlvConsoleHandlerFOpen(world.object());
                                 ZlvConsoleHandlerFClose(world.object());
                             }),
                   frameCase("ZlvFileHandlerFOpen framed", Kind::FileHandler, [](World &world) {
                       ZlvFileHandlerFOpen(world.object());
                       ZlvFileHandlerFClose(world.object());
                   })});
}

} // namespace zelvo_test
