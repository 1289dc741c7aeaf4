#include "cli/DruckBefehl.h"

#include "cli/Befehle.h"

#ifdef PRADILON_DRUCK
#include "data/InitMini.h"
#include "data/Uhr.h"
#include "data/Werte.h"
#include "output/Druckauftrag.h"
#include "output/qt/QtDrucker.h"

#include <QGuiApplication>
#endif

#include <cstdio>
#include <cstring>

#ifdef PRADILON_DRUCK
namespace {

// Standard error carries the job's messages as "title: text"; the GUI library's own chatter
// (no runtime folder, font fallbacks) is not for the user of a command-line tool.
void NurSchwereMeldungen(QtMsgType art, const QMessageLogContext &, const QString &text)
{
    if (art == QtCriticalMsg || art == QtFatalMsg)
        std::fprintf(stderr, "%s\n", qPrintable(text));
}

} // namespace
#endif

std::unique_ptr<QCoreApplication> NeueAnwendung(int &argc, char **argv)
{
#ifdef PRADILON_DRUCK
    if (argc > 1 && std::strcmp(argv[1], "print") == 0) {
        if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM") && qEnvironmentVariableIsEmpty("DISPLAY")
            && qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY"))
            qputenv("QT_QPA_PLATFORM", "offscreen");
        qInstallMessageHandler(NurSchwereMeldungen);
        return std::make_unique<QGuiApplication>(argc, argv);
    }
#endif
    return std::make_unique<QCoreApplication>(argc, argv);
}

#ifdef PRADILON_DRUCK

int DruckBefehl(const QStringList &argumente)
{
    // Argumente knows only options with a value; the two switches are taken out first.
    QStringList rest = argumente;
    DruckEinstellungen einstellungen{QString(), QStringLiteral("12"), QStringLiteral("1"), true, true};
    einstellungen.adressliste = rest.removeAll(QStringLiteral("--no-addresses")) == 0;
    einstellungen.plan = rest.removeAll(QStringLiteral("--no-plan")) == 0;
    const auto a = LeseAufruf("print", rest, {"--pdf", "--font", "--size", "--spacing"}, 1, "genau eine Datei");
    if (!a)
        return FalscherAufruf;
    const auto pdf = a->option("--pdf");
    if (!pdf || pdf->isEmpty())
        return Verwendungsfehler("print", QStringLiteral("print braucht --pdf OUT"));
    if (!einstellungen.adressliste && !einstellungen.plan)
        return Verwendungsfehler("print", QStringLiteral("--no-addresses und --no-plan zusammen lassen nichts zu drucken"));
    einstellungen.schriftgroesse = a->option("--size").value_or(einstellungen.schriftgroesse);
    einstellungen.zeilenabstand = a->option("--spacing").value_or(einstellungen.zeilenabstand);
    // The dialog offers only 1 to 3; a spacing of 0 or less would print every line on one spot.
    if (!(ZahlWert(einstellungen.zeilenabstand) > 0))
        return Verwendungsfehler("print", QStringLiteral("--spacing erwartet eine Zahl größer als 0"));

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a->positionen()[0], d, meldungen))
        return NichtGeladen;

    auto drucker = QtDrucker::pdfDatei(*pdf);
    drucker->waehleDrucker(0);
    if (drucker->schriftAnzahl() == 0) {
        SchreibeFehler(QStringLiteral("pradilon-cli: keine Schriften installiert\n"));
        return NichtGeschrieben;
    }
    einstellungen.schriftart = a->option("--font").value_or(drucker->schriftName(0));

    SystemUhr uhr;
    const DruckErgebnis ergebnis = Druckauftrag(*drucker, d, meldungen, uhr).fuehreAus(einstellungen);
    return ergebnis == DruckErgebnis::Gedruckt ? Erfolg : NichtGeschrieben;
}

#else

int DruckBefehl(const QStringList &)
{
    SchreibeFehler(QStringLiteral("pradilon-cli: print ist in diesem Build nicht enthalten (ohne Qt Gui gebaut)\n"));
    return FalscherAufruf;
}

#endif
