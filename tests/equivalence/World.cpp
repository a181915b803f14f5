// SPDX-License-Identifier: Apache-2.0
#include "World.h"

#include <cmath>
#include <iterator>
#include <utility>

#include <unicode/ucal.h>

#include "Choices.h"

namespace zelvo_equivalence {
namespace {

constexpr const char *LOG_FILE = "records.log";
constexpr double SECOND = 1000.0;

constexpr const char *FORMATTER_CLASSES[Tree::FORMATTERS] = {
    "zlv_basicformatter", "zlv_basicformatter",    "zlv_xmlformatter",
    "zlv_xmlformatter",   "zlv_vyxtraceformatter", "own"};

constexpr const char *FORMATTER_NAMES[Tree::FORMATTERS] = {"line",      "other.line", "xml",
                                                           "other.xml", "trace",      "own"};

/// Which formatters see what a logger gets.
constexpr size_t LISTENERS[Tree::LOGGERS][2] = {{0, 1}, {2, 4}, {3, 5}};

constexpr const char *FLAGS[] = {"singleComponent", "singleProduct",  "singleProductId",
                                 "singleServer",    "forceAsMessage", "forceAsTrace"};

} // namespace

double Clock::within(Random &random) const
{
    return std::floor(now_ / SECOND) * SECOND + random.below(1000);
}

/// A moment near a change of the zone's offset.
double Clock::nearTransition(Random &random) const
{
    UErrorCode status = U_ZERO_ERROR;
    UCalendar *calendar = ucal_open(zone_, -1, nullptr, UCAL_GREGORIAN, &status);
    ucal_setMillis(calendar, now_, &status);
    UDate transition = now_;
    ucal_getTimeZoneTransitionDate(
        calendar, random.oneIn(2) ? UCAL_TZ_TRANSITION_NEXT : UCAL_TZ_TRANSITION_PREVIOUS,
        &transition, &status);
    ucal_close(calendar);
    static constexpr double distances[] = {-1001, -1000, -1, 0, 1, 999, 1000};
    return U_SUCCESS(status) ? transition + random.of(distances) : now_;
}

void Clock::move(Random &random, Transcript &transcript)
{
    const double before = now_;
    if (!std::isfinite(now_) || std::abs(now_) > 1e16)
        now_ = anyTime(random);
    else if (const uint32_t way = random.below(16); way < 8)
        now_ = within(random);
    else if (way < 10)
        now_ += random.below(100000);
    else if (way == 10)
        now_ = std::floor(now_ / SECOND) * SECOND - random.below(2);
    else if (way == 11)
        now_ -= random.below(1000000);
    else if (way < 15)
        now_ = nearTransition(random);
    else
        now_ = anyTime(random);
    transcript.note("time", now_);
    if (now_ < before)
        transcript.count("steps back in time");
    if (std::floor(now_ / SECOND) == std::floor(before / SECOND))
        transcript.count("steps within a second");
}

Tree::Tree(Random &random, Transcript &transcript)
{
    for (size_t i = 0; i < FORMATTERS; ++i) {
        formatters_[i] = ZlvGetObject(FORMATTER_NAMES[i], FORMATTER_CLASSES[i]);
        handlers_[i] = ZlvGetObject(("to." + std::string{FORMATTER_NAMES[i]}).c_str(), "memory");
        ZlvHandlerSetFormatter(handlers_[i], formatters_[i]);
        change(i, random, transcript);
    }
    file_ = ZlvGetObject("file", "zlv_filehandler");
    ZlvSetObjProp(file_, "fileName", LOG_FILE);
    ZlvSetObjProp(file_, "maxFileBytes", "2000000000");
    ZlvHandlerSetFormatter(file_, formatters_[0]);
    for (size_t i = 0; i < LOGGERS; ++i) {
        loggers_[i] = ZlvGetObject(("logger." + std::to_string(i)).c_str(),
                                   i == 0 ? "zlv_basiclogger" : "zlv_pdlogger");
        ZlvSetObjProp(loggers_[i], "server", "store17.example.org");
        ZlvSetObjProp(loggers_[i], "product", "Shop");
        for (const size_t listener : LISTENERS[i])
            ZlvAddListener(loggers_[i], handlers_[listener]);
    }
    ZlvAddListener(loggers_[0], file_);
}

Tree::~Tree()
{
    for (ZlvObject *logger : loggers_)
        ZlvReleaseObject(logger);
    for (ZlvObject *handler : handlers_)
        ZlvReleaseObject(handler);
    ZlvReleaseObject(file_);
    for (ZlvObject *formatter : formatters_)
        ZlvReleaseObject(formatter);
}

void Tree::change(size_t formatter, Random &random, Transcript &transcript)
{
    const uint32_t which = random.below(8);
    const char *name = which < 3   ? "dateTimeFormat"
                       : which < 6 ? "locale"
                       : which < 7 ? "separator"
                                   : random.of(FLAGS);
    const char *value = which < 3   ? anyDatePattern(random)
                        : which < 6 ? (random.oneIn(5) ? nullptr : anyLocale(random))
                        : which < 7 ? anySeparator(random)
                                    : (random.oneIn(2) ? "true" : "false");
    transcript.note("formatter", FORMATTER_NAMES[formatter]);
    transcript.note(name, value);
    ZlvSetObjProp(formatters_[formatter], name, value);
    transcript.count("property changes");
}

void Tree::changeProperty(Random &random, Transcript &transcript)
{
    change(random.below(FORMATTERS), random, transcript);
}

void Tree::replaceFormatter(Random &random, Transcript &transcript)
{
    const size_t which = random.below(FORMATTERS);
    ZlvHandlerSetFormatter(handlers_[which], nullptr);
    if (which == 0)
        ZlvHandlerSetFormatter(file_, nullptr);
    ZlvReleaseObject(formatters_[which]);
    formatters_[which] = ZlvGetObject(FORMATTER_NAMES[which], FORMATTER_CLASSES[which]);
    change(which, random, transcript);
    ZlvHandlerSetFormatter(handlers_[which], formatters_[which]);
    if (which == 0)
        ZlvHandlerSetFormatter(file_, formatters_[which]);
    transcript.count("formatters replaced");
}

World::World(uint64_t seed, const char *transcriptPath)
    : endsIcu(seed % 2 == 0), hasUnknownLocales(seed % 4 >= 2), random(seed),
      transcript(transcriptPath), patterns(!endsIcu)
{
    useUnknownLocales(hasUnknownLocales);
    std::ofstream{LOG_FILE, std::ios::trunc};
    log.open(LOG_FILE, std::ios::binary);
}

World::~World()
{
    closeToolkit();
}

void World::openToolkit()
{
    ZlvOpenToolkit(nullptr, nullptr);
    addClasses();
    tree = new Tree{random, transcript};
}

void World::closeToolkit()
{
    delete std::exchange(tree, nullptr);
    ZlvCloseToolkit();
}

void World::readLog()
{
    log.clear();
    const std::string added{std::istreambuf_iterator<char>{log}, {}};
    transcript.result("file", Text{added});
}

} // namespace zelvo_equivalence
