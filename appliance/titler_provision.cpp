// titler_provision: fills the data path of the environment with the files that a titler needs and some sample
// titles. Prints the base path. Exits with 1 if something could not be written, with 2 if the data path is
// not usable.

#include "appliance/TitlerProvision.h"
#include "support/DataPathCheck.h"
#include "support/OwnerOnlyFiles.h"

#include <QApplication>
#include <QFontInfo>
#include <QTextStream>

#include <string>

int main(int argc, char* argv[])
{
    OwnerOnlyFiles::setUmask();
    // The pictures do not depend on a display, and there may be none.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    QTextStream out(stdout);
    QTextStream err(stderr);

    const std::string problem = DataPathCheck::problem();
    if (!problem.empty()) {
        err << "titler_provision: " << QString::fromStdString(problem) << "\n";
        return DataPathCheck::EXIT_CODE;
    }
    const QString base = TitlerProvision::basePathOfEnvironment();
    if (QFontInfo(QFont(QStringLiteral("KST"))).family() != QStringLiteral("KST"))
        err << "titler_provision: the fonts of the build are not in use (FONTCONFIG_FILE)\n";
    TitlerProvision provision(base);
    if (!provision.writeMissing()) {
        err << "titler_provision: " << provision.error() << "\n";
        return 1;
    }
    out << base << "\n";
    return 0;
}
