// SPDX-License-Identifier: Apache-2.0
// Opening and closing many times.
#include "support/DestructiveOrders.h"
#include "support/HeapInUse.h"

namespace zelvo_test {
namespace {

/// One whole life of the toolkit with some of everything.
void liveOnce(const char *path)
{
    ASSERT_EQ(ZlvOpenToolkit(path, nullptr), 1);
    ZlvObject *app = ZlvGetObject("app", "zlv_basiclogger");
    ZlvSetObjProp(app, "key", "value");
    ZlvAcquireObject(app);
    ZlvLogUText(app, u"text");
    ZlvGetObject("filter", "zlv_levelfilter");
    ZlvCloseToolkit();
}

TEST_F(ZlvDestructiveOrders, AThousandLivesLeaveMemoryAndDescriptorsFlat)
{
    close();
    write("life.properties", "app.listenerNames=out\nout.className=zlv_consolehandler\n"
                             "out.logging=off\nout.formatterName=format\n"
                             "format.className=zlv_basicformatter\nformat.locale=de\n");
    for (int warmUp = 0; warmUp < 10; ++warmUp)
        liveOnce("life.properties");
    auto descriptors = openDescriptors();
    size_t before = heapInUse();
    for (int life = 0; life < 1000; ++life)
        liveOnce("life.properties");
    EXPECT_EQ(openDescriptors(), descriptors);
    EXPECT_LE(heapInUse(), before + 1024) << "less than two bytes a life";
}

TEST_F(ZlvDestructiveOrders, AHundredFailedLivesLeaveMemoryAndDescriptorsFlat)
{
    close();
    for (int warmUp = 0; warmUp < 10; ++warmUp)
        EXPECT_EQ(tryOpen("app.level=WARN\nx=1\n"), 0);
    auto descriptors = openDescriptors();
    size_t before = heapInUse();
    for (int life = 0; life < 100; ++life)
        EXPECT_EQ(ZlvOpenToolkit("zelvo.properties", nullptr), 0);
    EXPECT_EQ(openDescriptors(), descriptors);
    EXPECT_LE(heapInUse(), before + 99);
}

} // namespace
} // namespace zelvo_test
