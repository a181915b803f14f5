// SPDX-License-Identifier: Apache-2.0
// A toolkit that is opened with a properties file while each system call of the reader fails.
#include <cerrno>
#include <cstdio>
#include <filesystem>

#include "CallFaults.h"
#include "support/Child.h"
#include "support/TestDir.h"
#include "zelvo.h"

using namespace zelvo_test;

namespace {

class FailingReader : public TestDir, public testing::WithParamInterface<int> {
protected:
    void SetUp() override
    {
        write("p.properties", "app.className = zlv_basiclogger\n" + std::string(9000, '#') + "\n");
    }

    /// Opens with a failing call; what it came to, told by the exit status of a child.
    static int openWith(uint32_t number)
    {
        return inChild([number] { return attempt(number); });
    }

    static int attempt(uint32_t number)
    {
        static CallTrace trace;
        CxStatus status{CX_STATUS_OK, 0};
        plotCallFault(&trace, {number, FAULT_FAIL, 1, GetParam()});
        const bool isOpen = ZlvOpenToolkit("p.properties", &status) != 0;
        plotCallFault(nullptr, {});
        if (number > trace.count)
            return NO_SUCH_CALL;
        const bool isClosing = trace.calls[number - 1] == CALL_CLOSE;
        const bool isTold = status.type == CX_STATUS_PLATFORM && status.code == GetParam();
        ZlvCloseToolkit();
        const bool opensAgain = ZlvOpenToolkit("p.properties", &status) != 0;
        ZlvCloseToolkit();
        // A failing close costs nothing: all has been read.
        return opensAgain && isOpen == isClosing && (isOpen || isTold) ? AS_STATED : OTHERWISE;
    }

    enum Outcome { AS_STATED, OTHERWISE, NO_SUCH_CALL };
};

} // namespace

TEST_P(FailingReader, IsToldAndTheNextOneReadsAll)
{
    uint32_t number = 1;
    int outcome = openWith(number);
    for (; outcome == AS_STATED; outcome = openWith(++number))
        continue;
    EXPECT_EQ(outcome, NO_SUCH_CALL) << "call " << number;
    EXPECT_GE(number, 5U); // opening, three pieces, closing
    std::printf("figures: faults: reader: %u calls failed with code %d\n", number - 1, GetParam());
}

INSTANTIATE_TEST_SUITE_P(Codes, FailingReader, testing::Values(EINTR, EIO, ENOSPC, EACCES, EMFILE));
