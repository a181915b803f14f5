// SPDX-License-Identifier: Apache-2.0
// Logs one record to the file app.log, as a user of C++ would.
#include <zelvo.hpp>

int main()
{
    const zelvo::Toolkit toolkit("app.properties");
    if (!toolkit)
        return 1;

    const zelvo::Logger logger("app.log");
    return logger.text(u"logged by {0}", u"C++").type == CX_STATUS_OK ? 0 : 1;
}
