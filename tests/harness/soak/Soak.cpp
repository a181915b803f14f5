// SPDX-License-Identifier: Apache-2.0
// Four processes log to a file that they share and to one of their own each, while a small disk
// fills up and is freed, live files are moved away and deleted, and the configuration changes ten
// times a second. In the end each acknowledged record has to be found, once.
#include <gtest/gtest.h>

#include <chrono>
#include <cstdio>
#include <memory>

#include "Place.h"
#include "SoakWriter.h"
#include "process/OwnSemaphore.h"
#include "support/Child.h"
#include "support/Limits.h"
#include "support/TestDir.h"

using namespace zelvo_test;

namespace {

using Clock = std::chrono::steady_clock;

constexpr uint32_t SEED = 7;
constexpr uint32_t FILLINGS = 10;
constexpr std::chrono::milliseconds BETWEEN_DISTURBANCES{40};
/// Far beyond what anything here takes: reaching it means that something hangs.
constexpr uint32_t SECONDS_TO_HANG = 120;

uint32_t secondsWanted()
{
    const char *wish = std::getenv("ZELVO_SOAK_SECONDS");
    return wish != nullptr ? static_cast<uint32_t>(std::strtoul(wish, nullptr, 10)) : 60;
}

/// What has become of the records of all streams.
struct Outcome {
    size_t acknowledged = 0;
    size_t found = 0;
    size_t lost = 0; ///< acknowledged records that are nowhere
    size_t doubled = 0;
    size_t cutShort = 0; ///< acknowledged records that the disk took a part of
    size_t refused = 0;
    size_t refusedAndFound = 0;
};

class Soak : public TestDir {
protected:
    /// Lets everything happen for a while.
    Outcome outcomeOf(uint32_t seconds, uint32_t swallowed = 0)
    {
        ledger_ = std::make_unique<Ledger>((seconds + SECONDS_TO_HANG) * MOST_RECORDS_A_SECOND);
        makePlaces();
        startWriters(seconds, swallowed);
        const auto start = Clock::now();
        for (uint32_t filling = 1; filling <= FILLINGS; ++filling) {
            disturbUntil(start +
                         std::chrono::milliseconds(1000) * seconds * filling / (FILLINGS + 1));
            fillAndFree();
        }
        disturbUntil(start + std::chrono::seconds(seconds));
        stopWriters();
        for (Place &place : places_)
            place.settleAll(tally_);
        return outcome();
    }

    void print(const Outcome &outcome) const
    {
        size_t moved = 0;
        size_t deleted = 0;
        for (const Place &place : places_) {
            moved += place.moved();
            deleted += place.deleted();
        }
        std::printf("figures: soak: %s filled and freed %u times, %zu live files moved away, "
                    "%zu deleted, %u removed by rollovers, %u rounds of changes\n",
                    disk_.isThere() ? "a disk of 8 MiB"
                                    : "NO DISK COULD BE MOUNTED: a pretended one",
                    FILLINGS, moved, deleted, removed(), changes());
        std::printf(
            "figures: soak: %u processes: %zu acknowledged, %zu found, %zu lost, %zu doubled; "
            "%zu cut short by the full disk, %zu refused (%zu of them found)\n",
            PROCESSES, outcome.acknowledged, outcome.found, outcome.lost, outcome.doubled,
            outcome.cutShort, outcome.refused, outcome.refusedAndFound);
    }

    /// Whatever is in the files, other than records and chatter, was cut short by the disk.
    void expectFragmentsExplained() const
    {
        size_t cut = 0;
        for (const SoakFaults &faults : ledger_->board().faults)
            cut += faults.cutShort;
        EXPECT_LE(tally_.fragments(), cut);
    }

private:
    void makePlaces()
    {
        Board &board = ledger_->board();
        places_.emplace_back(SHARED_PLACE, [&board] {
            return std::vector<uint32_t>(board.changes.begin(), board.changes.end());
        });
        for (uint32_t process = 0; process < PROCESSES; ++process)
            places_.emplace_back(ownPlace(process), [&board, process] {
                return std::vector<uint32_t>{board.streams[PROCESSES + process].begun};
            });
    }

    void startWriters(uint32_t seconds, uint32_t swallowed)
    {
        for (uint32_t process = 0; process < PROCESSES; ++process)
            writers_.push_back(std::make_unique<Child>([=, this] {
                alarm(seconds + SECONDS_TO_HANG);
                return soak({process, semaphore_.key(), SEED, process == 0 ? swallowed : 0},
                            *ledger_);
            }));
    }

    void stopWriters()
    {
        ledger_->board().stop = true;
        for (const auto &writer : writers_)
            EXPECT_EQ(writer->result(), 0);
        EXPECT_EQ(semaphore_.value(), 1);
    }

    void settle()
    {
        for (Place &place : places_)
            place.settle(tally_);
    }

    void disturbUntil(Clock::time_point end)
    {
        while (Clock::now() < end) {
            Place &place = places_[(random_() >> 8) % places_.size()];
            if ((random_() >> 8) % 2 == 0)
                place.moveLive(random_);
            else
                place.deleteLive(random_);
            settle();
            usleep(1000 * BETWEEN_DISTURBANCES.count()); // waits for nothing: it sets the pace
        }
    }

    /// Own logs find no space until each has been refused records, then space until each has got
    /// records again.
    void fillAndFree()
    {
        ledger_->board().isFull = !disk_.isThere();
        goOnUntilEachHasMore(&Stream::refused, [this] {
            if (disk_.isThere())
                SmallDisk::fill();
        });
        ledger_->board().isFull = false;
        SmallDisk::makeRoom();
        goOnUntilEachHasMore(&Stream::acknowledged, [] {});
    }

    void goOnUntilEachHasMore(std::atomic<uint32_t> Stream::*count,
                              const std::function<void()> &each)
    {
        constexpr uint32_t more = 3;
        std::vector<uint32_t> goals;
        for (uint32_t stream = PROCESSES; stream < STREAMS; ++stream)
            goals.push_back(ledger_->stream(stream).*count + more);
        const auto reached = [&] {
            for (uint32_t stream = PROCESSES; stream < STREAMS; ++stream)
                if (ledger_->stream(stream).*count < goals[stream - PROCESSES])
                    return false;
            return true;
        };
        const auto end = Clock::now() + std::chrono::seconds(SECONDS_TO_HANG);
        while (!reached() && Clock::now() < end) {
            each();
            settle();
            usleep(1000); // leaves the processors to those who are looked at; the counts decide
        }
        EXPECT_TRUE(reached());
    }

    Outcome outcome() const
    {
        Outcome sum;
        for (uint32_t stream = 0; stream < STREAMS; ++stream)
            for (uint32_t number = 1; number <= ledger_->stream(stream).begun; ++number)
                add(sum, ledger_->fate(stream, number), tally_.copiesOf(stream, number));
        return sum;
    }

    static void add(Outcome &sum, Fate fate, uint32_t copies)
    {
        const bool isFound = copies > 0;
        sum.acknowledged += fate == Fate::ACKNOWLEDGED;
        sum.found += fate == Fate::ACKNOWLEDGED && isFound;
        sum.lost += fate == Fate::ACKNOWLEDGED && !isFound;
        sum.doubled += copies > 1;
        sum.cutShort += fate == Fate::CUT_SHORT;
        sum.refused += fate == Fate::REFUSED;
        sum.refusedAndFound += fate == Fate::REFUSED && isFound;
    }

    uint32_t removed() const
    {
        uint32_t sum = 0;
        for (const SoakFaults &faults : ledger_->board().faults)
            sum += faults.removed;
        return sum;
    }

    uint32_t changes() const
    {
        uint32_t sum = 0;
        for (const auto &changes : ledger_->board().changes)
            sum += changes;
        return sum;
    }

    SmallDisk disk_{"size=8m"};
    OwnSemaphore semaphore_;
    std::minstd_rand random_{SEED};
    std::unique_ptr<Ledger> ledger_;
    Tally tally_{SEED};
    std::vector<Place> places_;
    std::vector<std::unique_ptr<Child>> writers_;
};

class SoakControl : public Soak {};

} // namespace

TEST_F(Soak, LosesAndDoublesNoAcknowledgedRecord)
{
    const Outcome outcome = outcomeOf(secondsWanted());
    print(outcome);
    EXPECT_GT(outcome.acknowledged, 0U);
    EXPECT_GT(outcome.refused, 0U);
    EXPECT_EQ(outcome.lost, 0U);
    EXPECT_EQ(outcome.doubled, 0U);
    EXPECT_EQ(outcome.refusedAndFound, 0U);
    expectFragmentsExplained();
}

TEST_F(SoakControl, FindsOneRecordThatWasNotWritten)
{
    constexpr uint32_t seconds = 3;
    constexpr uint32_t swallowed = 500;
    const Outcome outcome = outcomeOf(seconds, swallowed);
    std::printf("figures: soak: control: 1 of %zu acknowledged records swallowed, %zu missed\n",
                outcome.acknowledged, outcome.lost);
    EXPECT_EQ(outcome.lost, 1U);
}
