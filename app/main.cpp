#include "data/Uhr.h"
#include "plan/Zufall.h"
#include "ui/FormInfo.h"
#include "ui/FormMinis.h"
#include "ui/Hilfe.h"
#include "ui/QtMeldungen.h"
#include "ui/Umgebung.h"

#include <QApplication>
#include <QWindow>

int main(int argc, char *argv[])
{
    QApplication app(argc, argv);
    QApplication::setApplicationName(QStringLiteral("Pradilon"));
    QApplication::setApplicationVersion(QStringLiteral("1.00"));

    QtMeldungen meldungen;
    SystemUhr uhr;
    StandardZufall zufall;
    HilfeFenster hilfe;
    const Umgebung umgebung{meldungen, uhr, zufall, hilfe, QApplication::applicationDirPath()};

    FormMinis haupt(umgebung);
    QObject::connect(&haupt, &FormMinis::ProgrammEnde, &app, &QApplication::quit, Qt::QueuedConnection);

    // The info window comes first; it names the help file and shows the main window below it.
    auto *info = new FormInfo(haupt, hilfe, umgebung.programmOrdner);
    info->winId();
    if (info->windowHandle() && haupt.windowHandle())
        info->windowHandle()->setTransientParent(haupt.windowHandle());
    info->show();
    info->raise();
    info->activateWindow();

    return app.exec();
}
