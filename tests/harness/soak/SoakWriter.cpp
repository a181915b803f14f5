// SPDX-License-Identifier: Apache-2.0
#include "SoakWriter.h"

#include <chrono>
#include <random>
#include <thread>
#include <utility>

#include <unistd.h>

#include "process/RecordLogger.h"

namespace zelvo_test {

namespace {

constexpr std::chrono::milliseconds BETWEEN_CHANGES{100};
constexpr uint32_t RECORDS_FOR_A_CHATTER = 16;

struct Choice {
    const char *property;
    std::vector<const char *> values;
};

/// What changes in the configurations of a log: of its logger, handler and formatter.
const Choice LOGGER_CHOICES[] = {{"level", {"ALL", "INFO", "OFF", "DEBUG_MIN"}}};
const Choice FORMATTER_CHOICES[] = {
    {"dateTimeFormat", {"yyyy-MM-dd HH:mm:ss.SSS", "HH:mm:ss", "'day' D"}}};
const Choice HANDLER_CHOICES[] = {
    {"maxFileBytes", {"4096", "16384", "65536"}},
    {"maxFiles", {"1", "2", "3", "5"}},
    {"formatterName", {"plain", "dated"}},
    {"fileName", {LOG_NAMES[0], LOG_NAMES[1]}},
};

/// One of the two logs of a process.
class Log {
public:
    Log(const char *handlerClass, const std::string &place, const Job &job)
        : name_(place), place_(place), logger_(makeRecordLogger(handlerClass, job, place)),
          handler_(ZlvGetObject((place + ".file").c_str(), nullptr))
    {
        // From the start each change of the configuration names the file, and so closes it.
        for (const Choice &choice : HANDLER_CHOICES)
            changeHandler(choice, 0);
    }
    Log(const Log &) = delete;
    Log &operator=(const Log &) = delete;
    ~Log()
    {
        ZlvReleaseObject(handler_);
        ZlvReleaseObject(logger_);
    }

    ZlvObject *logger() const { return logger_; }

    void changeLogger(const Choice &choice, uint32_t random)
    {
        change(logger_, name_ + ".log", choice.property, valueOf(choice, random));
    }

    void changeHandler(const Choice &choice, uint32_t random)
    {
        std::string value = valueOf(choice, random);
        if (choice.property == std::string("fileName"))
            value = place_ + '/' + value;
        change(handler_, name_ + ".file", choice.property, value);
    }

    /// Sets a property of a configuration and applies the configuration.
    static void change(ZlvObject *object, const std::string &config, const char *property,
                       const std::string &value)
    {
        ZlvObjCfg *cfg = ZlvLogMgrGetCfg(config.c_str());
        ZlvSetObjCfgProp(cfg, property, value.c_str());
        ZlvLogMgrApplyCfg(object, config.c_str());
        ZlvReleaseObjCfg(cfg);
    }

    static std::string valueOf(const Choice &choice, uint32_t random)
    {
        return choice.values[random % choice.values.size()];
    }

private:
    std::string name_;
    std::string place_;
    ZlvObject *logger_;
    ZlvObject *handler_;
};

class Writer {
public:
    Writer(const SoakJob &job, Ledger &ledger)
        : job_(job), ledger_(ledger), plain_(ZlvGetObject("plain", LINE_FORMATTER)),
          dated_(ZlvGetObject("dated", "zlv_basicformatter")),
          shared_("zlv_multiproc_filehandler", SHARED_PLACE, jobOf(SHARED_PLACE, sharedStream())),
          own_("zlv_filehandler", ownPlace(job.process), jobOf(ownPlace(job.process), ownStream()))
    {
    }
    Writer(const Writer &) = delete;
    Writer &operator=(const Writer &) = delete;
    ~Writer()
    {
        ZlvReleaseObject(dated_);
        ZlvReleaseObject(plain_);
    }

    void logUntilStopped()
    {
        const uint32_t pause = 1000000 / MOST_RECORDS_A_SECOND;
        for (uint32_t number = 1; !ledger_.board().stop && number <= ledger_.capacity(); ++number) {
            log(shared_, sharedStream(), number);
            if (number == job_.swallowed)
                swallowNextWrite();
            refuseWrites(ledger_.board().isFull);
            log(own_, ownStream(), number);
            refuseWrites(0); // the shared file, which chatter may roll over, has space
            if (number % RECORDS_FOR_A_CHATTER == 0)
                chatter();
            usleep(pause); // waits for nothing: it keeps a long run small
        }
    }

    void changeUntilStopped()
    {
        std::minstd_rand random(job_.seed + job_.process);
        while (!ledger_.board().stop) {
            for (Log *log : {&shared_, &own_})
                changeSomething(*log, random);
            ++ledger_.board().changes[job_.process];
            std::this_thread::sleep_for(BETWEEN_CHANGES); // waits for nothing: it sets the pace
        }
    }

private:
    uint32_t sharedStream() const { return job_.process; }
    uint32_t ownStream() const { return PROCESSES + job_.process; }

    Job jobOf(const std::string &place, uint32_t stream) const
    {
        return {.file = place + '/' + LOG_NAMES[0],
                .key = job_.key,
                .seed = job_.seed,
                .writer = stream};
    }

    void log(const Log &log, uint32_t stream, uint32_t number)
    {
        ledger_.begin(stream, number);
        wasCutShort();
        const bool succeeded =
            logRecord(log.logger(), {.seed = job_.seed, .writer = stream}, number);
        const Fate written = wasCutShort() ? Fate::CUT_SHORT : Fate::ACKNOWLEDGED;
        ledger_.end(stream, number, succeeded ? written : Fate::REFUSED);
    }

    /// What passes or not as the level of the moment is; nobody counts it.
    void chatter()
    {
        ZlvLogDebugMin(own_.logger(), "soak", "chatter", 1, u"chatter");
        ZlvLogDebugMax(shared_.logger(), "soak", "chatter", 1, u"chatter");
    }

    void changeSomething(Log &log, std::minstd_rand &random)
    {
        const auto next = [&random] { return static_cast<uint32_t>(random()) >> 8; };
        for (const Choice &choice : LOGGER_CHOICES)
            log.changeLogger(choice, next());
        log.changeHandler(HANDLER_CHOICES[next() % std::size(HANDLER_CHOICES)], next());
        for (const Choice &choice : FORMATTER_CHOICES)
            Log::change(dated_, "dated", choice.property, Log::valueOf(choice, next()));
    }

    SoakJob job_;
    Ledger &ledger_;
    ZlvObject *plain_;
    ZlvObject *dated_;
    Log shared_;
    Log own_;
};

} // namespace

std::string ownPlace(uint32_t process)
{
    return std::string(OWN_PLACES) + "/own" + std::to_string(process);
}

int soak(const SoakJob &job, Ledger &ledger)
{
    startSoakFaults(&ledger.board().faults[job.process]);
    if (!ZlvOpenToolkit(nullptr, nullptr))
        return 1;
    addLineFormatter();
    {
        Writer writer(job, ledger);
        std::thread changes([&] { writer.changeUntilStopped(); });
        writer.logUntilStopped();
        changes.join();
    }
    ZlvCloseToolkit();
    return 0;
}

} // namespace zelvo_test
