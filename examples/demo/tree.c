// SPDX-License-Identifier: Apache-2.0
// Act one: a logger, a filter, two consoles and two formatters, all from demo.properties.
#include "acts.h"
#include "zelvo.h"

/// The directory of compiled messages; ICU picks the file of the locale in it.
static const char BUNDLE[] = DEMO_BUNDLE;

/// One day in a shop, on all seven levels.
static void openShop(ZlvObject *log)
{
    const UChar *name = u"Müller & Söhne";
    const int32_t articles = 12500;
    const double worth = 98765.432;

    // The levels of an operator: messages from a bundle, with a text, an integer and a double.
    ZlvLogInfo(log, BUNDLE, "opened", name, articles, worth);
    ZlvLogWarn(log, BUNDLE, "low_stock", u"Tee", 1250, 2500.5);
    ZlvLogError(log, BUNDLE, "payment_failed", 1299.9, u"Visa");
    ZlvLogFatal(log, BUNDLE, "no_database", u"db.example.org", 3);

    // The levels of a developer: a pattern in the source, with its place there.
    ZlvLogDebugMin(log, "tree.c", __func__, __LINE__, u"the door was opened");
    ZlvLogDebugMid(log, "tree.c", __func__, __LINE__, u"counted {0,number,integer}", articles);
    ZlvLogDebugMax(log, "tree.c", __func__, __LINE__, u"rate {0,number} for {1}", 0.19, name);
}

/// Sets one property of the object of that name, which demo.properties describes.
static void change(const char *object, const char *property, const char *value)
{
    ZlvObject *changed = ZlvGetObject(object, NULL);
    ZlvSetObjProp(changed, property, value);
    ZlvReleaseObject(changed);
}

void showTree(void)
{
    // An object lives while somebody holds it: another object that it belongs to, or the program.
    // The program holds the filter too, so that it keeps its changes while nobody listens to it.
    ZlvObject *log = ZlvGetObject("shop.log", NULL);
    ZlvObject *filter = ZlvGetObject("filter.worries", NULL);

    scene("Seven calls, two consoles",
          "The English console takes all seven records. The German one stands behind a filter\n"
          "that lets WARN and above pass, and writes times and numbers its own way.");
    openShop(log);

    scene("The logger's level becomes INFO", "The same seven calls: the debug records are gone.");
    change("shop.log", "level", "INFO");
    openShop(log);

    scene("A formatter's locale becomes ja, the filter's level ERROR",
          "The second console now speaks Japanese, and WARN no longer reaches it.");
    change("format.german", "locale", "ja_JP");
    change("filter.worries", "level", "ERROR");
    openShop(log);

    scene("The logger's only listener becomes the filter",
          "The English console falls silent; ERROR and FATAL still pass the filter.");
    change("shop.log", "listenerNames", "filter.worries");
    openShop(log);

    ZlvReleaseObject(filter);
    ZlvReleaseObject(log);
}
