// SPDX-License-Identifier: MIT
// One case, once, for tools that count instructions or memory: statreport_single_run report|floor|data ROWS
// OUT.pdf
#include "ReportCases.h"
#include "SyntheticHost.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QApplication>

#include <cstdio>
#include <cstdlib>
#include <cstring>

int main(int argc, char **argv)
{
    if (argc < 4) {
        std::fputs("usage: statreport_single_run report|floor|data ROWS OUT.pdf\n", stderr);
        return 2;
    }
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    acss::QtAdvancedStylesheet::substituteFonts();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    fillSyntheticHost(std::atoi(argv[2]));
    if (std::strcmp(argv[1], "floor") == 0)
        return printFloor(QString::fromLocal8Bit(argv[3])) ? 0 : 1;
    TableReport report;
    if (std::strcmp(argv[1], "data") == 0)
        return 0;
    return report.print(QString::fromLocal8Bit(argv[3])) ? 0 : 1;
}
