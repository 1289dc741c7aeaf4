#include "data/Cp1252.h"
#include "support_seiten.h"
#include "ui/FormFileBrw.h"
#include "ui/FormPlan.h"

#include <QDir>
#include <QFile>
#include <QListWidget>

class TestEndeZuEnde : public Seitentest
{
    Q_OBJECT

    void waehle(const char *menue, const char *seitenname)
    {
        QVERIFY(Waehle(*f, QString::fromUtf8(menue)));
        seite = kind(f.get(), QString::fromUtf8(seitenname));
        QVERIFY(seite->isVisible() && !menueAn());
    }

private slots:

    void vomLeerenProgrammZuDateiPlanUndAdressliste()
    {
        starte(QStringLiteral("FrameMinis"));
        for (int i = 0; i < 60; ++i)
            t->zufall.dazu((i * 37 % 100) / 100.0);

        // The roster as a user types it: name, first name, street, town, phone, a tick, an excluded date.
        waehle("MnuListe", "FrameMinis");
        const char *roster[][7] = {
            {"Zander", "Zoe", "Hauptstraße 1", "12345 Köln", "0221 1", "CheckOmi", "19.12.26-20.12.26"},
            {"Meier", "Anna", "Am Bach 2", "12345 Köln", "0221 2", "CheckSamstag", ""},
            {"de Vries", "Dirk", "Weg 3", "12346 Porz", "", "", ""},
            {"Müller", "Jörg", "Grüne Gasse 4", "12345 Köln", "0221 „4“", "", "24.12.2026"},
            {"Meierhof", "Bert", "Am Bach 2", "12345 Köln", "0221 5", "CheckNicht", ""},
        };
        const QStringList felder{"TxtName", "TxtVorname", "TxtStrasse", "TxtOrt", "TxtTelefon"};
        for (const auto &e : roster) {
            klick("BtnHinzufügen");
            for (int i = 0; i < 5; ++i)
                tipp(felder[i], e[i]);
            if (*e[5])
                klick(e[5]);
            if (*e[6]) {
                tipp("CmbTermine", e[6]);
                QTest::keyClick(kind<QComboBox>(seite, "CmbTermine")->lineEdit(), Qt::Key_Return);
            }
        }
        klick("BtnOK");
        QStringList namen;
        for (int i = 0; i < d().AnzahlMinis; ++i)
            namen << d().Minis[i].Name + ',' + d().Minis[i].Vorname;
        QCOMPARE(namen.join(u' '), "Meier,Anna Meierhof,Bert Müller,Jörg Zander,Zoe de Vries,Dirk");

        // Regular services on Saturday and Sunday, and Christmas Day as a holiday page.
        waehle("MnuTermine", "FrameGodi");
        const char *dienste[][2] = {{"TxtZeit1(7)", "18.00"}, {"TxtMiniAnz1(7)", "1"}, {"TxtZeit1(1)", "9.30"},
                                    {"TxtMiniAnz1(1)", "2"}, {"BtnHinzufügen2", ""},  {"TxtDatum", "25.12.26"},
                                    {"TxtZeitT1", "10.00"},  {"TxtMiniAnzT1", "3"},   {"BtnOK2", ""}};
        for (const auto &[feld, wert] : dienste)
            *wert ? tipp(feld, wert) : klick(feld);

        // The plan for three weeks and a bit.
        waehle("MnuPlanErstellen", "FramePlan");
        tipp("TxtStartDatum", "5.12.26");
        tipp("TxtEndDatum", "27.12.2026");
        klick("BtnErstellen");
        QVERIFY(!seite->isVisible() && d().Geaendert && menueAn() && t->meldungen.gezeigt().empty());
        QCOMPARE(d().AnzahlPlanEintraege, int16_t(9));

        // The plan view shows the lines of the plan text.
        QVERIFY(Waehle(*f, QStringLiteral("MnuPlanAnzeigen")));
        QVERIFY((seite = OffenesFenster<FormPlan>()));
        QCOMPARE(seite->windowTitle(), "Plan (05.12.2026 - 27.12.2026)");
        QByteArray gezeigt;
        auto *liste = kind<QListWidget>(seite, "ListPlan");
        for (int i = 0; i < liste->count(); ++i)
            QVERIFY(KodiereCp1252(liste->item(i)->text() + "\r\n", gezeigt));
        klick("BtnOK");
        Aufraeumen();
        QVERIFY(!OffenesFenster<FormPlan>() && f->isEnabled());

        // Saved under a new name in the program's folder, then both text exports beside it.
        QVERIFY(Waehle(*f, QStringLiteral("MnuSpeichernUnter")));
        QVERIFY((seite = OffenesFenster<FormFileBrw>()));
        tipp("TxtDatei", "ende.prd");
        klick("CmdOK");
        Aufraeumen();
        QVERIFY(Waehle(*f, QStringLiteral("MnuPlanSpeichern")));
        QVERIFY(Waehle(*f, QStringLiteral("MnuAdressenSpeichern")));
        auto inhalt = [](const QString &pfad) {
            QFile datei(pfad);
            return datei.open(QIODevice::ReadOnly) ? datei.readAll() : QByteArray();
        };
        const QString plan = QDir::toNativeSeparators(t->pfad("PLAN.TXT"));
        const QString adressen = QDir::toNativeSeparators(t->pfad("ADRESS.TXT"));
        QCOMPARE(t->meldungen.texte(), QStringList({"Plan wird unter " + plan + " gespeichert",
                                                    "Adressliste wird unter " + adressen + " gespeichert"}));
        // Byte for byte as expected; the expected files are not empty.
        for (const char *name : {"ende.prd", "PLAN.TXT", "ADRESS.TXT"})
            QCOMPARE(inhalt(t->pfad(name)), inhalt(QStringLiteral(PRADILON_TESTDATEN "/endezuende/") + name));
        QCOMPARE(gezeigt, inhalt(plan));
    }
};

QTEST_MAIN(TestEndeZuEnde)
#include "tst_endezuende.moc"
