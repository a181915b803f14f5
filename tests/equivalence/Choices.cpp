// SPDX-License-Identifier: Apache-2.0
#include "Choices.h"

#include <cmath>
#include <limits>

namespace zelvo_equivalence {
namespace {

constexpr const char *LOCALES[] = {
    "th_TH",
    "th_TH@calendar=gregorian;numbers=thai",
    "th_TH_TH",
    "fa_IR",
    "fa",
    "ar_EG",
    "ar",
    "ar_SA",
    "ar_MA",
    "hi",
    "hi_IN@numbers=deva",
    "mr_IN",
    "bn_BD",
    "my",
    "ja_JP@calendar=japanese",
    "ja_JP",
    "zh_Hant_TW@calendar=roc",
    "zh@numbers=hanidec",
    "zh@numbers=hant",
    "he_IL@calendar=hebrew",
    "en@numbers=roman",
    "tr",
    "tr_TR",
    "az",
    "lt",
    "de",
    "de_DE",
    "de_CH",
    "de_AT",
    "de_DE@collation=phonebook",
    "fr_CA",
    "fr",
    "fr_CH",
    "es",
    "es_419",
    "pl",
    "pt_PT",
    "sv",
    "en",
    "en_US",
    "en_IN",
    "en_GB",
    "en_US_POSIX",
    "en-US",
    "EN_us",
    "root",
    "und",
    "",
    "@numbers=arab",
    "en_US@calendar=buddhist",
    "en@calendar=nonsense;numbers=nonsense",
    "de_DE_a_rather_long_name_of_a_variant_that_nobody_has_ever_needed_for_anything_at_all_yet",
};

constexpr const char *UNKNOWN_LOCALES[] = {"C",          "xx_YY", "nonsense",
                                           "no locale!", "x",     "i-klingon"};

bool hasUnknownLocales = false;

constexpr const char16_t *ZONES[] = {
    u"UTC",
    u"Europe/Berlin",
    u"America/New_York",
    u"America/St_Johns",
    u"America/Sao_Paulo",
    u"Asia/Kolkata",
    u"Asia/Kathmandu",
    u"Asia/Tehran",
    u"Australia/Lord_Howe",
    u"Pacific/Apia",
    u"Pacific/Chatham",
    u"Africa/Casablanca",
    u"Africa/Monrovia",
    u"Europe/Dublin",
    u"Antarctica/Troll",
    u"Etc/GMT+12",
    u"GMT-00:30",
    u"GMT+05:17:23",
    u"CET",
    u"PST",
    u"Nonsense/Zone",
    u"",
};

constexpr const char *DATE_PATTERNS[] = {
    nullptr,
    nullptr,
    nullptr,
    "yyyy-MM-dd HH:mm:ss.SSS",
    "yyyy-MM-dd HH:mm:ss",
    "yyyy-MM-dd'T'HH:mm:ss.SSSXXX",
    "HH:mm",
    "ss.SSS",
    "SSS",
    "S",
    "SS",
    "SSSSSS",
    "SSS SSS",
    "S.SS",
    "A",
    "AAAAAAAAAA",
    "'SSS' ss",
    "'000' ss 'SSS'SSS",
    "ss.S'00'",
    "EEEE d MMMM y G, HH:mm:ss",
    "EEE, d MMM yy h:mm a",
    "yyyy-MM-dd HH:mm:ss.SSS z",
    "zzzz SSS",
    "VVVV",
    "VV O OOOO",
    "xxxxx X Z ZZZZ",
    "D w W F u U r Q QQQQ",
    "G GGGG GGGGG y",
    "''yyyy''",
    "'never closed",
    "",
    " ",
    "J nonsense",
    "\xC3\xA4 yyyy 'f\xC3\xBCr' \xE2\x82\xAC",
    "\x84 dd",
    "yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy yyyy "
    "MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM MM SSS",
    "dd.MM.yyyy HH:mm:ss",
    "h:mm:ss.SSS a",
};

constexpr const char *CONVERTERS[] = {
    "UTF-8",        "UTF-8",  "UTF-8",     "UTF-8",   "US-ASCII", "ISO-8859-1",
    "windows-1252", "EUC-JP", "Shift_JIS", "gb18030", "KOI8-R",   "ibm-1047",
};

constexpr const char *SEPARATORS[] = {nullptr, " ", "|", "", ";;", "\xC3\xA4", "\t", "{0}", "'"};

constexpr int32_t INTEGERS[] = {0,     1,       -1,        2,          9,         10,
                                99,    100,     999,       1000,       -1000,     1001,
                                9999,  10000,   -12345,    99999,      100000,    1234567,
                                -9999, 2000000, 987654321, 2147483647, INT32_MIN, -2147483647};

constexpr double DOUBLES[] = {
    0.0,
    -0.0,
    1.0,
    -1.0,
    0.5,
    0.1,
    -0.125,
    1e-5,
    5e-6,
    1e-300,
    5e-324,
    2.5,
    3.5,
    1234.5678,
    99999.999996,
    1e14,
    999999999999999.0,
    1e15,
    1e16,
    1234567890123456789.0,
    999999999999999872.0,
    -9007199254740993.0,
    1e21,
    1e30,
    1e31,
    -1e31,
    1e300,
    std::numeric_limits<double>::max(),
    std::numeric_limits<double>::infinity(),
    -std::numeric_limits<double>::infinity(),
    std::numeric_limits<double>::quiet_NaN(),
};

constexpr double TIMES[] = {
    0.0,
    999.0,
    1000.0,
    -1.0,
    -1000.0,
    -1001.0,
    1709294400000.0,
    253402300799999.0,
    253402300800000.0,
    -62135596800000.0,
    -12219292800001.0, // the end of the Julian calendar
    8640000000000000.0,
    -8640000000000001.0,
    1e17,
    -1e17,
    1e300,
    0.25,
    999.75,
    -0.5,
    1709294400000.5,
    std::numeric_limits<double>::infinity(),
    std::numeric_limits<double>::quiet_NaN(),
};

char16_t anyUnit(Random &random, uint32_t style)
{
    static constexpr char16_t strange[] = {
        u'\t',  u'\n',  u'\r',  0x01,   0x1B,   0x7F,   0x80,   0x85,   0xA0,   0xD800,
        0xDBFF, 0xDC00, 0xDFFF, 0x200B, 0x200F, 0x2028, 0xFEFF, 0xFFFD, 0xFFFE, 0xFFFF,
        u'\'',  u'{',   u'}',   u'|',   u'#',   u'<',   u'&',   u'"',   u'\\',  u'%'};
    if (style == 0 || random.below(4) != 0)
        return static_cast<char16_t>(0x20 + random.below(0x5F));
    if (style == 1)
        return static_cast<char16_t>(0xA1 + random.below(0x15F));
    if (style == 2)
        return static_cast<char16_t>(0x3041 + random.below(0x2000));
    return random.of(strange);
}

void addPair(Random &random, std::u16string &text)
{
    text += static_cast<char16_t>(0xD800 + random.below(0x400));
    text += static_cast<char16_t>(0xDC00 + random.below(0x400));
}

uint32_t anyLength(Random &random)
{
    if (random.oneIn(40))
        return random.below(5000);
    if (random.oneIn(8))
        return 230 + random.below(60); // about the first area that ICU writes into
    return random.below(40);
}

} // namespace

void useUnknownLocales(bool use)
{
    hasUnknownLocales = use;
}

const char *anyLocale(Random &random)
{
    return hasUnknownLocales && random.oneIn(4) ? random.of(UNKNOWN_LOCALES) : random.of(LOCALES);
}

const char16_t *anyZone(Random &random)
{
    return random.of(ZONES);
}

const char *anyDatePattern(Random &random)
{
    return random.of(DATE_PATTERNS);
}

const char *anyConverter(Random &random)
{
    return random.of(CONVERTERS);
}

const char *anySeparator(Random &random)
{
    return random.of(SEPARATORS);
}

int32_t anyInteger(Random &random)
{
    const auto bits = static_cast<int32_t>(random.next());
    return random.oneIn(2) ? random.of(INTEGERS) : bits >> random.below(32);
}

double anyDouble(Random &random)
{
    if (random.oneIn(2))
        return random.of(DOUBLES);
    const double exponent = random.below(40) - 20.0;
    return static_cast<double>(anyInteger(random)) * std::pow(10.0, exponent);
}

double anyTime(Random &random)
{
    constexpr double year = 365.25 * 24 * 3600 * 1000;
    if (random.oneIn(4))
        return random.of(TIMES);
    const double years = random.below(250) - 120.0; // 1850 to 2100
    return std::floor(years * year + static_cast<double>(random.next() % 31557600000));
}

std::u16string anyText(Random &random)
{
    const uint32_t style = random.below(5);
    const uint32_t length = anyLength(random);
    std::u16string text;
    while (text.size() < length)
        if (style == 4)
            addPair(random, text);
        else
            text += anyUnit(random, style);
    return text;
}

std::string anyBytes(Random &random)
{
    const uint32_t style = random.below(3);
    const uint32_t length = anyLength(random) % 600;
    std::string bytes;
    while (bytes.size() < length)
        if (style == 0)
            bytes += static_cast<char>(0x20 + random.below(0x5F));
        else if (style == 1)
            bytes += static_cast<char>(1 + random.below(255));
        else
            bytes += random.oneIn(3) ? "\xE2\x82\xAC" : "e\xC3\xA9";
    return bytes;
}

} // namespace zelvo_equivalence
