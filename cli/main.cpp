#include "cli/Befehle.h"
#include "cli/DruckBefehl.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

QString Uebersicht()
{
    QString text = QStringLiteral("Aufruf: pradilon-cli BEFEHL ...\n\nBefehle:\n");
    for (const Befehl &b : AlleBefehle())
        text += QStringLiteral("  pradilon-cli ") + QString::fromUtf8(b.aufruf) + u'\n';
    text += QStringLiteral(
        "\n\"pradilon-cli BEFEHL --help\" beschreibt einen Befehl.\n"
        "Rückgabe: 0 Erfolg, 1 Datei nicht lesbar, 2 Zeitraum abgelehnt, 3 Rechenfehler,\n"
        "4 nichts zu schreiben, 5 Datei nicht schreibbar, 64 falscher Aufruf.\n");
    return text;
}

QString Hilfe(const Befehl &b)
{
    return QStringLiteral("Aufruf: pradilon-cli ") + QString::fromUtf8(b.aufruf) + QStringLiteral("\n\n")
           + QString::fromUtf8(b.hilfe) + u'\n';
}

bool IstHilfe(const QString &arg)
{
    return arg == QLatin1String("--help") || arg == QLatin1String("-h");
}

} // namespace

int main(int argc, char *argv[])
{
    const auto app = NeueAnwendung(argc, argv);
    QStringList argumente = QCoreApplication::arguments().mid(1);
    if (argumente.isEmpty()) {
        SchreibeFehler(Uebersicht());
        return FalscherAufruf;
    }
    const QString name = argumente.takeFirst();
    if (IstHilfe(name)) {
        SchreibeAus(Uebersicht());
        return Erfolg;
    }
    for (const Befehl &b : AlleBefehle()) {
        if (name != QLatin1String(b.name))
            continue;
        if (std::any_of(argumente.cbegin(), argumente.cend(), IstHilfe)) {
            SchreibeAus(Hilfe(b));
            return Erfolg;
        }
        return b.ausfuehren(argumente);
    }
    SchreibeFehler(QStringLiteral("pradilon-cli: unbekannter Befehl ") + name + QStringLiteral("\n\n") + Uebersicht());
    return FalscherAufruf;
}
