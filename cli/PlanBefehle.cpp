#include "cli/Befehle.h"

#include "data/DatenDatei.h"
#include "data/InitMini.h"
#include "data/Uhr.h"
#include "output/TextExport.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"

#include <QDate>

#include <memory>

int PlanBefehl(const QStringList &argumente)
{
    const auto a = LeseAufruf("plan", argumente, {"--seed", "-o"}, 3, "FILE, START und END");
    if (!a)
        return FalscherAufruf;
    std::unique_ptr<StandardZufall> zufall = std::make_unique<StandardZufall>();
    if (const auto seed = a->option("--seed")) {
        bool ok = false;
        const uint startwert = seed->toUInt(&ok);
        if (!ok)
            return Verwendungsfehler("plan", QStringLiteral("--seed erwartet eine Zahl von 0 bis 4294967295"));
        zufall = std::make_unique<StandardZufall>(startwert);
    }

    CliMeldungen meldungen;
    InitMini d;
    const QString datei = a->positionen()[0];
    if (!LadeDatei(datei, d, meldungen))
        return NichtGeladen;

    SystemUhr uhr;
    PlanGenerator generator(d, *zufall);
    switch (generator.BtnErstellen_Click(a->positionen()[1], a->positionen()[2], meldungen, uhr)) {
    case PlanGenerator::Ergebnis::Abgelehnt:
        return ZeitraumAbgelehnt;
    case PlanGenerator::Ergebnis::Fehler:
        return Rechenfehler;
    case PlanGenerator::Ergebnis::Fertig:
        break;
    }

    const QString ziel = a->option("-o").value_or(datei);
    d.AlterDateiname = d.Dateiname;
    d.Dateiname = ziel;
    return Speichern(d, meldungen, ziel != datei) == SpeicherErgebnis::Gespeichert ? Erfolg : NichtGeschrieben;
}

namespace {

int AusgangVon(ExportErgebnis ergebnis)
{
    switch (ergebnis) {
    case ExportErgebnis::Geschrieben:
        return Erfolg;
    case ExportErgebnis::Fehlgeschlagen:
        return NichtGeschrieben;
    case ExportErgebnis::Abgebrochen:
    case ExportErgebnis::NichtsZuSchreiben:
        break;
    }
    return NichtsZuSchreiben;
}

} // namespace

int PlanTextBefehl(const QStringList &argumente)
{
    const auto a = LeseAufruf("plan-text", argumente, {"-o"}, 1, "genau eine Datei");
    if (!a)
        return FalscherAufruf;

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a->positionen()[0], d, meldungen))
        return NichtGeladen;
    const auto pfad = a->option("-o");
    return AusgangVon(pfad ? PlanAlsTextSpeichern(d, meldungen, *pfad) : PlanAlsTextSpeichern(d, meldungen));
}

int AdressenTextBefehl(const QStringList &argumente)
{
    const auto a = LeseAufruf("addresses-text", argumente, {"-o"}, 1, "genau eine Datei");
    if (!a)
        return FalscherAufruf;

    CliMeldungen meldungen;
    InitMini d;
    if (!LadeDatei(a->positionen()[0], d, meldungen))
        return NichtGeladen;
    const QDate heute = SystemUhr().jetzt().date();
    const auto pfad = a->option("-o");
    return AusgangVon(pfad ? AdresslisteAlsTextSpeichern(d, meldungen, heute, *pfad)
                           : AdresslisteAlsTextSpeichern(d, meldungen, heute));
}
