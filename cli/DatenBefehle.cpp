#include "cli/Befehle.h"

#include "data/DatenDatei.h"
#include "data/InitMini.h"

int InfoBefehl(const QStringList &argumente)
{
    const auto a = LeseAufruf("info", argumente, {}, 1, "genau eine Datei");
    if (!a)
        return FalscherAufruf;

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a->positionen()[0], d, meldungen))
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
    const auto a = LeseAufruf("save", argumente, {}, 2, "FILE und OUT");
    if (!a)
        return FalscherAufruf;

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a->positionen()[0], d, meldungen))
        return NichtGeladen;
    // As "Speichern unter": the browser marks the data changed before it saves under a new name.
    d.AlterDateiname = d.Dateiname;
    d.Dateiname = a->positionen()[1];
    d.Geaendert = true;
    return Speichern(d, meldungen, true) == SpeicherErgebnis::Gespeichert ? Erfolg : NichtGeschrieben;
}
