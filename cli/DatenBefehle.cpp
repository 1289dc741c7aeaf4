#include "cli/Befehle.h"

#include "data/DatenDatei.h"
#include "data/InitMini.h"

int InfoBefehl(const QStringList &argumente)
{
    const Argumente a(argumente, {});
    if (!a.gueltig())
        return Verwendungsfehler("info", a.fehler());
    if (a.positionen().size() != 1)
        return Verwendungsfehler("info", QStringLiteral("info erwartet genau eine Datei"));

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a.positionen()[0], d, meldungen))
        return NichtGeladen;
    SchreibeAus(QStringLiteral("Minis: %1\nAusnahmen: %2\nPlaneinträge: %3\nIntervall: %4\nGeschwister: %5\n")
                    .arg(d.AnzahlMinis)
                    .arg(d.AnzahlAusnahmen)
                    .arg(d.AnzahlPlanEintraege)
                    .arg(d.Intervall)
                    .arg(d.Geschwister ? QStringLiteral("ja") : QStringLiteral("nein")));
    return Erfolg;
}

int SaveBefehl(const QStringList &argumente)
{
    const Argumente a(argumente, {});
    if (!a.gueltig())
        return Verwendungsfehler("save", a.fehler());
    if (a.positionen().size() != 2)
        return Verwendungsfehler("save", QStringLiteral("save erwartet FILE und OUT"));

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a.positionen()[0], d, meldungen))
        return NichtGeladen;
    // As "Speichern unter": the browser marks the data changed before it saves under a new name.
    d.AlterDateiname = d.Dateiname;
    d.Dateiname = a.positionen()[1];
    d.Geaendert = true;
    return Speichern(d, meldungen, true) == SpeicherErgebnis::Gespeichert ? Erfolg : NichtGeschrieben;
}
