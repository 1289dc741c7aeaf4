#include "output/TextExport.h"

#include "data/Cp1252.h"
#include "data/Datum.h"
#include "data/InitMini.h"
#include "data/Meldungen.h"

#include <QSaveFile>

#include <algorithm>
#include <functional>

namespace {

const QString Tab = QStringLiteral("\t");

QString AdressZeile(const Mini &m)
{
    return m.Name + Tab + m.Vorname + Tab + m.Strasse + Tab + m.Telefon;
}

// Confirmation, writing and failure message, shared by both commands.
ExportErgebnis Exportiere(const QString &titel, const QString &frage, const QString &pfad, bool nichtsZuSchreiben,
                          const std::function<QStringList()> &zeilen, Meldungen &meldungen)
{
    if (meldungen.zeige(frage, Knoepfe::OKAbbrechen, Symbol::Keins, titel) != Antwort::OK)
        return ExportErgebnis::Abgebrochen;
    if (nichtsZuSchreiben)
        return ExportErgebnis::NichtsZuSchreiben;
    if (!SchreibeTextDatei(pfad, zeilen())) {
        meldungen.zeige(QStringLiteral("Datei ") + pfad + QStringLiteral(" konnte nicht geschrieben werden."),
                        Knoepfe::OK, Symbol::Kritisch, titel);
        return ExportErgebnis::Fehlgeschlagen;
    }
    return ExportErgebnis::Geschrieben;
}

} // namespace

QString PfadNebenDatei(const QString &dateiname, const QString &name)
{
#ifdef Q_OS_WIN
    const qsizetype letzter = std::max(dateiname.lastIndexOf(u'\\'), dateiname.lastIndexOf(u'/'));
#else
    const qsizetype letzter = dateiname.lastIndexOf(u'/');
#endif
    return dateiname.left(letzter + 1) + name;
}

QStringList PlanZeilen(const InitMini &d)
{
    QStringList zeilen;
    // Never read past what the plan holds, whatever the count claims.
    const int anzahl = std::min<int>(d.AnzahlPlanEintraege, int(d.Plan.size()));
    if (anzahl <= 0)
        return zeilen;
    zeilen.reserve(2 + anzahl * 8);
    zeilen << QStringLiteral("Ministrantenplan vom ") + d.Plan[0].Datum + QStringLiteral(" bis ")
                  + d.Plan[std::size_t(anzahl - 1)].Datum;
    zeilen << QString();
    for (int i = 0; i < anzahl; ++i) {
        const PlanEintrag &e = d.Plan[std::size_t(i)];
        zeilen << QString();
        zeilen << e.Wochentag + QStringLiteral(", den ") + e.Datum + QStringLiteral(", ") + e.Zeit
                      + QStringLiteral(" Uhr");
        const int plaetze = std::min<int>(e.MiniAnz, MaxPlaetze);
        for (int k = 0; k < plaetze; ++k)
            zeilen << QStringLiteral("\t\t") + e.Vorname[std::size_t(k)] + QStringLiteral(" ") + e.Name[std::size_t(k)];
    }
    return zeilen;
}

QStringList AdressZeilen(const InitMini &d, const QDate &heute)
{
    const int anzahl = std::min<int>(d.AnzahlMinis, int(d.Minis.size()));
    QStringList zeilen;
    zeilen << QStringLiteral("Adressverzeichnis aller Ministranten\t(Stand ") + DatumText(heute) + QStringLiteral(")");
    zeilen << QString() << QString();
    for (int i = 0; i < anzahl; ++i) {
        if (!d.Minis[std::size_t(i)].Oberministrant)
            zeilen << AdressZeile(d.Minis[std::size_t(i)]);
    }
    zeilen << QString() << QString() << QStringLiteral("Oberministranten") << QString();
    for (int i = 0; i < anzahl; ++i) {
        if (d.Minis[std::size_t(i)].Oberministrant)
            zeilen << AdressZeile(d.Minis[std::size_t(i)]);
    }
    return zeilen;
}

bool SchreibeTextDatei(const QString &pfad, const QStringList &zeilen, QString *fehler)
{
    QByteArray bytes;
    for (const QString &zeile : zeilen) {
        if (!KodiereCp1252(zeile, bytes)) {
            if (fehler)
                *fehler = QStringLiteral("Zeichen außerhalb von Windows-1252");
            return false;
        }
        bytes += "\r\n";
    }
    QSaveFile datei(pfad);
    if (!datei.open(QIODevice::WriteOnly) || datei.write(bytes) != bytes.size() || !datei.commit()) {
        if (fehler)
            *fehler = datei.errorString();
        datei.cancelWriting();
        return false;
    }
    return true;
}

ExportErgebnis PlanAlsTextSpeichern(const InitMini &d, Meldungen &meldungen)
{
    return PlanAlsTextSpeichern(d, meldungen, PfadNebenDatei(d.Dateiname, QStringLiteral("PLAN.TXT")));
}

ExportErgebnis PlanAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QString &pfad)
{
    return Exportiere(QStringLiteral("Plan als Text speichern"),
                      QStringLiteral("Plan wird unter ") + pfad + QStringLiteral(" gespeichert"), pfad,
                      d.AnzahlPlanEintraege <= 0, [&d] { return PlanZeilen(d); }, meldungen);
}

ExportErgebnis AdresslisteAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QDate &heute)
{
    return AdresslisteAlsTextSpeichern(d, meldungen, heute,
                                       PfadNebenDatei(d.Dateiname, QStringLiteral("ADRESS.TXT")));
}

ExportErgebnis AdresslisteAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QDate &heute,
                                           const QString &pfad)
{
    return Exportiere(QStringLiteral("Adressliste als Text speichern"),
                      QStringLiteral("Adressliste wird unter ") + pfad + QStringLiteral(" gespeichert"), pfad,
                      false, [&d, &heute] { return AdressZeilen(d, heute); }, meldungen);
}
