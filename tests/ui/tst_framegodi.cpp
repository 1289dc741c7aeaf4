#include "ui/FrameGodi.h"

#include "support_seiten.h"

class TestFrameGodi : public Seitentest
{
    Q_OBJECT

    FrameGodi *godi() { return static_cast<FrameGodi *>(seite); }
    void oeffne(const QStringList &daten)
    {
        d().Ausnahmen.resize(daten.size() + 1);
        for (int i = 0; i < daten.size(); ++i)
            d().Ausnahmen[i].Datum = daten[i];
        d().AnzahlAusnahmen = int16_t(daten.size());
        godi()->MnuTermine_Click();
    }
    // The dates of the pages in the working copy.
    QString seiten()
    {
        QStringList l;
        for (int i = 0; i < godi()->AnzahlSeiten; ++i)
            l << godi()->Seiten[i].Datum;
        return l.join(u',');
    }

private slots:
    void init() { starte(QStringLiteral("FrameGodi")); }

    void rasterMitPruefungBeiOK()
    {
        d().Regulaer[7].Zeit[3] = QStringLiteral("7:4");
        oeffne({});
        tipp("TxtZeit1(1)", " 10 Uhr ");
        tipp("TxtMiniAnz2(6)", "40");
        for (const char *wert : {"41", "40.5", "4 1"}) {
            tipp("TxtMiniAnz3(5)", wert);
            klick("BtnOK2");
        }
        const QString meldung = QStringLiteral(
            "Fehler in Anwendung: Sie haben die Maximalzahl von Ministranten bei der Einteilung unter 'reguläre "
            "Gottesdienste' überschritten. Diese beträgt  40. Bitte korrigieren Sie auf einen kleineren Wert!");
        QCOMPARE(meldungen(), QStringList(3, meldung));
        QVERIFY(seite->isVisible() && !menueAn() && !d().Geaendert && d().Regulaer[1].Zeit[0].isEmpty());
        tipp("TxtMiniAnz3(5)", "3 Minis");
        klick("BtnOK2");
        QVERIFY(!seite->isVisible() && d().Geaendert && menueAn());
        const auto &r = d().Regulaer;
        QCOMPARE(QStringList({r[1].Zeit[0], r[6].MiniAnz[1], r[5].MiniAnz[2], r[7].Zeit[3]}).join(u'|'),
                 " 10 Uhr |40|3 Minis|7:4");
    }

    void blaetternAnDenEndenUndUnlesbaresDatum()
    {
        oeffne({"01.01.2003", "02.01.2003"});
        klick("BtnLeft2");
        tipp("TxtDatum", "1.2.02");
        klick("BtnRight2");
        tipp("TxtDatum", "3.1.03");
        klick("BtnRight2");
        // At the last page "Vor" stores nothing; leafing on normalises the dates.
        QCOMPARE(seiten(), "01.02.2002,02.01.2003");
        klick("BtnLeft2");
        klick("BtnLeft2");
        QCOMPARE(seiten() + " / " + text("TxtDatum"), "01.02.2002,03.01.2003 / 01.02.2002");
        // A page with an unreadable date is removed.
        klick("BtnRight2");
        tipp("TxtDatum", "31.02.2003");
        klick("BtnLeft2");
        const QString meldung = QStringLiteral("Fehler in Anwendung: Sie haben ungültige Werte unter Datum "
                                               "eingegeben. Die Seite wurde nicht übernommen.");
        QCOMPARE(meldungen(), QStringList{meldung});
        QCOMPARE(seiten() + " / " + text("TxtDatum"), "01.02.2002 / 01.02.2002");
        // Even the only page: OK removes it and still closes.
        tipp("TxtDatum", "Ostern");
        klick("BtnOK2");
        QCOMPARE(meldungen().last(), meldung);
        QVERIFY(!seite->isVisible() && d().Geaendert && d().AnzahlAusnahmen == 0);
    }

    void okSortiertNachDatumstext()
    {
        oeffne({"24.03.2002"});
        for (const char *datum : {"1.12.2002", "15.06.02", "05.01.2003", "6.12.02", "01.12.2002"}) {
            klick("BtnHinzufügen2");
            tipp("TxtDatum", datum);
        }
        klick("BtnOK2");
        godi()->MnuTermine_Click();
        // Compared as text: the day of the month comes first.
        QCOMPARE(seiten(), "01.12.2002,01.12.2002,05.01.2003,06.12.2002,15.06.2002,24.03.2002");
    }
};

QTEST_MAIN(TestFrameGodi)
#include "tst_framegodi.moc"
