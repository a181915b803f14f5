// SPDX-License-Identifier: Apache-2.0
// Pieces of an XML record that come from the event's level and properties.
#include "ZlvPDXMLFormatter.h"

#include <algorithm>
#include <cstring>
#include <iterator>

#include "ZlvLevelWords.h"
#include "ZlvRecord.h"

using namespace zelvo;

namespace {

/// Properties that have an element of their own.
constexpr const char *placedProperties[] = {
    "threadId",         "correlationId",    "client",
    "zlv_prop_srcfile", "zlv_prop_srcline", "zlv_prop_srcfunction",
    "server",           "serverFormat",     "product",
    "component",        "productInstance",  "processId",
};

void addServer(CxUStringBuff *out, const ZlvEvent *event)
{
    const char *server = propertyOf(event, "server");
    if (server == nullptr)
        return;
    append(out, u" <Server Format=\"");
    appendProperty(out, event, "serverFormat");
    append(out, u"\">");
    CxUStringBuffAppendStr(out, server);
    append(out, u"</Server>\n");
}

} // namespace

ZlvBool zlvPDXMLCheckKey(const char *key)
{
    if (key == nullptr)
        return 0;
    const auto isIt = [key](const char *placed) {
        return *placed == *key && std::strcmp(placed, key) == 0; // the first letter settles most
    };
    return std::none_of(std::begin(placedProperties), std::end(placedProperties), isIt);
}

void zlvPDXMLEmitULevel(CxUStringBuff *buff, ZlvLevel level)
{
    CxUStringBuffAppendUStr(buff, wordsOf(level).word);
}

void zlvPDXMLEmitUProductInfo(CxUStringBuff *buff, const ZlvEvent *event, ZlvBool server,
                              ZlvBool product, ZlvBool component, ZlvBool productInstance)
{
    if (server != 0)
        addServer(buff, event);
    if (product != 0)
        appendProperty(buff, event, "product", u" <ProductId>", u"</ProductId>\n");
    if (component != 0)
        appendProperty(buff, event, "component", u" <Component>", u"</Component>\n");
    if (productInstance != 0)
        appendProperty(buff, event, "productInstance", u" <ProductInstance>",
                       u"</ProductInstance>\n");
}

ZlvBool zlvPDXMLEmitUSource(CxUStringBuff *buff, const ZlvEvent *event)
{
    if (!appendProperty(buff, event, "zlv_prop_srcfile", u" <Source FileName=\""))
        return 0;
    appendProperty(buff, event, "zlv_prop_srcfunction", u"\" Method=\"");
    appendNumber(buff, event, "zlv_prop_srcline", appendSigned, u"\" Line=\"");
    append(buff, u"\"/>\n");
    return 1;
}
