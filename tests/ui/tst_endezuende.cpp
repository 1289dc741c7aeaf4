#include "data/Cp1252.h"
#include "output/TextExport.h"
#include "support_seiten.h"
#include "support_umgebung.h"
#include "ui/FormFileBrw.h"
#include "ui/FormMinis.h"
#include "ui/FormPlan.h"
#include "ui/FrameGodi.h"
#include "ui/FrameMinis.h"
#include "ui/FramePlan.h"

#include <QCheckBox>
#include <QDir>
#include <QFile>
#include <QListWidget>
#include <QPushButton>
#include <QTest>

namespace {

struct Eingabe {
    const char *name, *vorname, *strasse, *ort, *telefon;
    const char *haken;       // objectName of a check box to tick, or nullptr
    const char *termin;      // one excluded-dates entry, or nullptr
};

QByteArray Inhalt(const QString &pfad)
{
    QFile datei(pfad);
    return datei.open(QIODevice::ReadOnly) ? datei.readAll() : QByteArray();
}

} // namespace

class TestEndeZuEnde : public QObject
{
    Q_OBJECT

private:
    // Compares a written file with its expected twin byte for byte. On a difference the written
    // file is kept in the temporary folder of the system for a look.
    void vergleiche(const QString &geschrieben, const QString &name)
    {
        const QByteArray ist = Inhalt(geschrieben);
        const QByteArray soll = Inhalt(QStringLiteral(PRADILON_TESTDATEN "/endezuende/") + name);
        if (ist.isEmpty() || ist != soll) {
            const QString kopie = QDir::temp().filePath(QStringLiteral("endezuende-") + name);
            QFile::remove(kopie);
            QFile::copy(geschrieben, kopie);
            QFAIL(qPrintable(QStringLiteral("%1 differs, written file kept as %2").arg(name, kopie)));
        }
    }

private slots:
    void vomLeerenProgrammZuDateiPlanUndAdressliste()
    {
        Testumgebung t;
        // One number per position; more than the plan below needs.
        for (int i = 0; i < 60; ++i)
            t.zufall.dazu((i * 37 % 100) / 100.0);
        auto f = NeuesHauptfenster(t);

        // The roster, typed in as a user does.
        QVERIFY(Waehle(*f, QStringLiteral("MnuListe")));
        auto *minis = kind<FrameMinis>(f.get(), QStringLiteral("FrameMinis"));
        QVERIFY(minis->isVisible());
        QVERIFY(!Erreichbar(*f, QStringLiteral("MnuLaden")));
        const Eingabe roster[] = {
            {"Zander", "Zoe", "Hauptstraße 1", "12345 Köln", "0221 1", "CheckOmi", "19.12.26-20.12.26"},
            {"Meier", "Anna", "Am Bach 2", "12345 Köln", "0221 2", "CheckSamstag", nullptr},
            {"de Vries", "Dirk", "Weg 3", "12346 Porz", "", nullptr, nullptr},
            {"Müller", "Jörg", "Grüne Gasse 4", "12345 Köln", "0221 „4“", nullptr, "24.12.2026"},
            {"Meierhof", "Bert", "Am Bach 2", "12345 Köln", "0221 5", "CheckNicht", nullptr},
        };
        for (const Eingabe &e : roster) {
            klicke(kind<QPushButton>(minis, QStringLiteral("BtnHinzufügen")));
            tippe(kind<QLineEdit>(minis, QStringLiteral("TxtName")), QString::fromUtf8(e.name));
            tippe(kind<QLineEdit>(minis, QStringLiteral("TxtVorname")), QString::fromUtf8(e.vorname));
            tippe(kind<QLineEdit>(minis, QStringLiteral("TxtStrasse")), QString::fromUtf8(e.strasse));
            tippe(kind<QLineEdit>(minis, QStringLiteral("TxtOrt")), QString::fromUtf8(e.ort));
            tippe(kind<QLineEdit>(minis, QStringLiteral("TxtTelefon")), QString::fromUtf8(e.telefon));
            if (e.haken)
                klicke(kind<QCheckBox>(minis, QString::fromUtf8(e.haken)));
            if (e.termin) {
                auto *termine = kind<QComboBox>(minis, QStringLiteral("CmbTermine"));
                tippe(termine, QString::fromUtf8(e.termin));
                drueckeEnter(termine);
            }
        }
        klicke(kind<QPushButton>(minis, QStringLiteral("BtnOK")));
        QVERIFY(!minis->isVisible());
        QCOMPARE(f->Daten().AnzahlMinis, int16_t(5));

        // Regular services on Saturday and Sunday, and Christmas Day as a holiday page.
        QVERIFY(Waehle(*f, QStringLiteral("MnuTermine")));
        auto *godi = kind<FrameGodi>(f.get(), QStringLiteral("FrameGodi"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtZeit1(7)")), QStringLiteral("18.00"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtMiniAnz1(7)")), QStringLiteral("1"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtZeit1(1)")), QStringLiteral("9.30"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtMiniAnz1(1)")), QStringLiteral("2"));
        klicke(kind<QPushButton>(godi, QStringLiteral("BtnHinzufügen2")));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtDatum")), QStringLiteral("25.12.26"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtZeitT1")), QStringLiteral("10.00"));
        tippe(kind<QLineEdit>(godi, QStringLiteral("TxtMiniAnzT1")), QStringLiteral("3"));
        klicke(kind<QPushButton>(godi, QStringLiteral("BtnOK2")));
        QVERIFY(!godi->isVisible());

        // The plan for three weeks and a bit.
        QVERIFY(Waehle(*f, QStringLiteral("MnuPlanErstellen")));
        auto *panel = kind<FramePlan>(f.get(), QStringLiteral("FramePlan"));
        tippe(kind<QLineEdit>(panel, QStringLiteral("TxtStartDatum")), QStringLiteral("5.12.26"));
        tippe(kind<QLineEdit>(panel, QStringLiteral("TxtEndDatum")), QStringLiteral("27.12.2026"));
        klicke(kind<QPushButton>(panel, QStringLiteral("BtnErstellen")));
        QVERIFY(!panel->isVisible());
        QVERIFY(t.meldungen.gezeigt().empty());
        QCOMPARE(f->Daten().AnzahlPlanEintraege, int16_t(9));
        QVERIFY(f->Daten().Geaendert);

        // The plan view lists the lines of the plan text.
        QVERIFY(Waehle(*f, QStringLiteral("MnuPlanAnzeigen")));
        auto *ansicht = OffenesFenster<FormPlan>();
        QVERIFY(ansicht);
        QCOMPARE(ansicht->windowTitle(), QStringLiteral("Plan (05.12.2026 - 27.12.2026)"));
        auto *liste = kind<QListWidget>(ansicht, QStringLiteral("ListPlan"));
        QStringList gezeigt;
        for (int i = 0; i < liste->count(); ++i)
            gezeigt << liste->item(i)->text();
        klicke(kind<QPushButton>(ansicht, QStringLiteral("BtnOK")));
        Aufraeumen();
        QVERIFY(f->isEnabled());

        // Saved under a new name in the program's folder, then both text exports beside it.
        QVERIFY(Waehle(*f, QStringLiteral("MnuSpeichernUnter")));
        auto *browser = OffenesFenster<FormFileBrw>();
        QVERIFY(browser);
        tippe(kind<QLineEdit>(browser, QStringLiteral("TxtDatei")), QStringLiteral("ende.prd"));
        klicke(kind<QPushButton>(browser, QStringLiteral("CmdOK")));
        Aufraeumen();
        const QString datei = t.pfad(QStringLiteral("ende.prd"));
        QCOMPARE(QDir::fromNativeSeparators(f->Daten().Dateiname), datei);
        QVERIFY(!f->Daten().Geaendert);
        QVERIFY(Waehle(*f, QStringLiteral("MnuPlanSpeichern")));
        QVERIFY(Waehle(*f, QStringLiteral("MnuAdressenSpeichern")));
        const QString plan = QDir::toNativeSeparators(t.pfad(QStringLiteral("PLAN.TXT")));
        const QString adressen = QDir::toNativeSeparators(t.pfad(QStringLiteral("ADRESS.TXT")));
        QCOMPARE(t.meldungen.texte(), (QStringList{QStringLiteral("Plan wird unter ") + plan + QStringLiteral(" gespeichert"),
                                                   QStringLiteral("Adressliste wird unter ") + adressen
                                                       + QStringLiteral(" gespeichert")}));

        vergleiche(datei, QStringLiteral("ende.prd"));
        vergleiche(plan, QStringLiteral("PLAN.TXT"));
        vergleiche(adressen, QStringLiteral("ADRESS.TXT"));
        QByteArray zeilen;
        for (const QString &z : gezeigt) {
            QVERIFY(KodiereCp1252(z, zeilen));
            zeilen += "\r\n";
        }
        QCOMPARE(zeilen, Inhalt(plan));
    }
};

QTEST_MAIN(TestEndeZuEnde)
#include "tst_endezuende.moc"
