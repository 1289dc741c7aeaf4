#include "ui/FrameGodi.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"
#include "support_seiten.h"

#include <QLineEdit>
#include <QPushButton>
#include <QTest>

#include <memory>

namespace {

AusnahmeSeite seite(const QString &datum, const QString &zeit1 = {}, const QString &anzahl1 = {})
{
    AusnahmeSeite s;
    s.Datum = datum;
    s.Zeit[0] = zeit1;
    s.MiniAnz[0] = anzahl1;
    return s;
}

void setzeSeiten(InitMini &d, const std::vector<AusnahmeSeite> &seiten)
{
    d.Ausnahmen = seiten;
    d.Ausnahmen.emplace_back();
    d.AnzahlAusnahmen = int16_t(seiten.size());
}

const QString MeldungRaster = QStringLiteral(
    "Sie haben die Maximalzahl von Ministranten bei der Einteilung unter 'reguläre Gottesdienste' überschritten. "
    "Diese beträgt  40. Bitte korrigieren Sie auf einen kleineren Wert!");
const QString MeldungSeite = QStringLiteral(
    "Sie haben die Maximalzahl von Ministranten bei der Einteilung unter 'Ausnahmen/Feiertage' überschritten. "
    "Diese beträgt  40. Die Werte wurden nicht übernommen! Bitte überprüfen Sie Ihre zuletzt bearbeitete Seite "
    "und korrigieren Sie auf einen kleineren Wert!");
const QString MeldungDatum =
    QStringLiteral("Sie haben ungültige Werte unter Datum eingegeben. Die Seite wurde nicht übernommen.");

} // namespace

class TestFrameGodi : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<InitMini> d;
    std::unique_ptr<TestMeldungen> meldungen;
    std::unique_ptr<SeitenHauptfenster> fenster;
    FrameGodi *godi = nullptr;

    QLineEdit *txt(const QString &name) { return kind<QLineEdit>(godi, name); }
    QLineEdit *zeit(int k, int tag) { return txt(QStringLiteral("TxtZeit%1(%2)").arg(k).arg(tag)); }
    QLineEdit *anzahl(int k, int tag) { return txt(QStringLiteral("TxtMiniAnz%1(%2)").arg(k).arg(tag)); }
    QLineEdit *datum() { return txt(QStringLiteral("TxtDatum")); }
    QPushButton *btn(const char *name) { return kind<QPushButton>(godi, QString::fromUtf8(name)); }
    QStringList gespeicherteDaten() const
    {
        QStringList l;
        for (int i = 0; i < d->AnzahlAusnahmen; ++i)
            l << d->Ausnahmen[i].Datum;
        return l;
    }
    QStringList seitenDaten() const
    {
        QStringList l;
        for (int i = 0; i < godi->AnzahlSeiten; ++i)
            l << godi->Seiten[i].Datum;
        return l;
    }

private slots:
    void init()
    {
        d = std::make_unique<InitMini>();
        meldungen = std::make_unique<TestMeldungen>();
        fenster = std::make_unique<SeitenHauptfenster>();
        godi = new FrameGodi(*d, *meldungen, *fenster);
        fenster->nimmSeite(godi);
        fenster->show();
        QVERIFY(QTest::qWaitForWindowExposed(fenster.get()));
    }
    void cleanup() { fenster.reset(); }

    void rasterZeigtUndSpeichertJedenWochentag()
    {
        for (int tag = 1; tag <= 7; ++tag) {
            for (int k = 0; k < 4; ++k) {
                d->Regulaer[tag].Zeit[k] = QStringLiteral("%1:%2").arg(tag).arg(k + 1);
                d->Regulaer[tag].MiniAnz[k] = QString::number(tag * 4 + k);
            }
        }
        godi->MnuTermine_Click();
        QVERIFY(godi->isVisible());
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QCOMPARE(zeit(3, 1)->text(), QStringLiteral("1:3"));
        QCOMPARE(anzahl(4, 7)->text(), QStringLiteral("31"));
        QCOMPARE(anzahl(1, 2)->text(), QStringLiteral("8"));
        // The blocks stand Montag .. Donnerstag above, Freitag .. Sonntag below, times left.
        auto pos = [this](QWidget *w) { return w->mapTo(godi, QPoint(0, 0)); };
        QVERIFY(pos(zeit(1, 2)).x() < pos(zeit(1, 3)).x());
        QVERIFY(pos(zeit(1, 5)).x() > pos(zeit(1, 4)).x());
        QVERIFY(pos(zeit(1, 6)).y() > pos(zeit(4, 2)).y());
        QCOMPARE(pos(zeit(1, 6)).x(), pos(zeit(1, 2)).x());
        QVERIFY(pos(zeit(1, 1)).x() > pos(zeit(1, 7)).x());
        QVERIFY(pos(anzahl(2, 3)).x() > pos(zeit(2, 3)).x());
        QCOMPARE(pos(anzahl(2, 3)).y(), pos(zeit(2, 3)).y());
        QVERIFY(pos(zeit(2, 3)).y() > pos(zeit(1, 3)).y());

        tippe(zeit(1, 1), QStringLiteral(" 10 Uhr "));
        tippe(anzahl(1, 1), QStringLiteral("3 Minis"));
        tippe(anzahl(2, 6), QStringLiteral("40"));
        klicke(btn("BtnOK2"));
        QVERIFY(meldungen->gezeigt().empty());
        QVERIFY(!godi->isVisible());
        QCOMPARE(fenster->aufrufe.last(), QStringLiteral("MenueAktivieren"));
        QVERIFY(d->Geaendert);
        QCOMPARE(d->Regulaer[1].Zeit[0], QStringLiteral(" 10 Uhr "));
        QCOMPARE(d->Regulaer[1].MiniAnz[0], QStringLiteral("3 Minis"));
        QCOMPARE(d->Regulaer[6].MiniAnz[1], QStringLiteral("40"));
        QCOMPARE(d->Regulaer[7].Zeit[3], QStringLiteral("7:4"));
        QCOMPARE(d->AnzahlAusnahmen, int16_t(0));
    }

    void rasterPruefungVerweigertOK_data()
    {
        QTest::addColumn<QString>("wert");
        QTest::newRow("41") << QStringLiteral("41");
        QTest::newRow("40.5") << QStringLiteral("40.5");
        QTest::newRow("mit Blanks") << QStringLiteral("4 1");
    }
    void rasterPruefungVerweigertOK()
    {
        QFETCH(QString, wert);
        godi->MnuTermine_Click();
        tippe(zeit(1, 3), QStringLiteral("8.00"));
        tippe(anzahl(3, 5), wert);
        klicke(btn("BtnOK2"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungRaster});
        QCOMPARE(meldungen->gezeigt()[0].symbol, Symbol::Kritisch);
        QCOMPARE(meldungen->gezeigt()[0].titel, QStringLiteral("Fehler in Anwendung"));
        QVERIFY(godi->isVisible());
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QCOMPARE(d->Regulaer[3].Zeit[0], QString());
        QVERIFY(!d->Geaendert);
        QCOMPARE(anzahl(3, 5)->text(), wert);
    }

    void ohneSeitenLeerUndGesperrt()
    {
        setzeSeiten(*d, {seite("01.01.2003", "9.00", "2")});
        godi->MnuTermine_Click();
        QCOMPARE(datum()->text(), QStringLiteral("01.01.2003"));
        klicke(btn("BtnAbbruch2"));
        d->AnzahlAusnahmen = 0;
        godi->DatenGeladen();

        godi->MnuTermine_Click();
        QCOMPARE(datum()->text(), QString());
        QCOMPARE(txt("TxtZeitT1")->text(), QString());
        QCOMPARE(txt("TxtMiniAnzT1")->text(), QString());
        for (const char *aus : {"TxtDatum", "TxtZeitT4", "TxtMiniAnzT2", "BtnLeft2", "BtnRight2", "BtnLöschen2",
                                "BtnAlleLöschen"})
            QVERIFY2(!godi->findChild<QWidget *>(QString::fromUtf8(aus))->isEnabled(), aus);
        QVERIFY(btn("BtnHinzufügen2")->isEnabled());
        QCOMPARE(fenster->focusWidget(), btn("BtnHinzufügen2"));

        klicke(btn("BtnHinzufügen2"));
        QVERIFY(datum()->isEnabled());
        QCOMPARE(godi->AnzahlSeiten, int16_t(1));
        QCOMPARE(fenster->focusWidget(), datum());
        QCOMPARE(godi->Seiten[0].Datum, QString());
    }

    void blaetternAnDenEndenUndDatumNormalisiert()
    {
        setzeSeiten(*d, {seite("01.01.2003"), seite("02.01.2003")});
        godi->MnuTermine_Click();
        klicke(btn("BtnLeft2"));
        QCOMPARE(godi->AktuelleSeite, int16_t(0));
        QCOMPARE(fenster->focusWidget(), datum());
        tippe(datum(), QStringLiteral("1.2.02"));
        klicke(btn("BtnRight2"));
        QCOMPARE(datum()->text(), QStringLiteral("02.01.2003"));
        tippe(datum(), QStringLiteral("3.1.03"));
        klicke(btn("BtnRight2"));
        // At the last page nothing is stored.
        QCOMPARE(godi->Seiten[1].Datum, QStringLiteral("02.01.2003"));
        QCOMPARE(datum()->text(), QStringLiteral("3.1.03"));
        klicke(btn("BtnLeft2"));
        QCOMPARE(datum()->text(), QStringLiteral("01.02.2002"));
        QCOMPARE(godi->Seiten[1].Datum, QStringLiteral("03.01.2003"));
        // An emptied date box keeps the page's date.
        tippe(datum(), QString());
        tippe(txt("TxtZeitT2"), QStringLiteral("11.00"));
        klicke(btn("BtnRight2"));
        klicke(btn("BtnLeft2"));
        QCOMPARE(datum()->text(), QStringLiteral("01.02.2002"));
        QCOMPARE(txt("TxtZeitT2")->text(), QStringLiteral("11.00"));
        QVERIFY(meldungen->gezeigt().empty());
    }

    void unlesbaresDatumEntferntSeite()
    {
        setzeSeiten(*d, {seite("01.01.2003", "9.00", "2"), seite("02.01.2003", "10.00", "3")});
        godi->MnuTermine_Click();
        klicke(btn("BtnRight2"));
        tippe(datum(), QStringLiteral("31.02.2003"));
        tippe(txt("TxtZeitT1"), QStringLiteral("verloren"));
        klicke(btn("BtnLeft2"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungDatum});
        QCOMPARE(meldungen->gezeigt()[0].symbol, Symbol::Keins);
        QCOMPARE(meldungen->gezeigt()[0].titel, QStringLiteral("Fehler in Anwendung"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(1));
        QCOMPARE(godi->AktuelleSeite, int16_t(0));
        QCOMPARE(godi->Seiten.size(), size_t(2));
        QCOMPARE(godi->Seiten[1].Datum, QString());
        QCOMPARE(datum()->text(), QStringLiteral("01.01.2003"));
        QCOMPARE(txt("TxtZeitT1")->text(), QStringLiteral("9.00"));

        // The only page with an unreadable date: OK removes it and still closes.
        tippe(datum(), QStringLiteral("Ostern"));
        klicke(btn("BtnOK2"));
        QCOMPARE(meldungen->texte().size(), 2);
        QVERIFY(!godi->isVisible());
        QCOMPARE(d->AnzahlAusnahmen, int16_t(0));
        QVERIFY(d->Geaendert);
    }

    void hinzufuegenSpeichertUndHaengtAn()
    {
        setzeSeiten(*d, {seite("01.01.2003"), seite("02.01.2003"), seite("03.01.2003")});
        godi->MnuTermine_Click();
        klicke(btn("BtnRight2"));
        tippe(txt("TxtMiniAnzT3"), QStringLiteral("5"));
        klicke(btn("BtnHinzufügen2"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(4));
        QCOMPARE(godi->AktuelleSeite, int16_t(3));
        QCOMPARE(godi->Seiten[1].MiniAnz[2], QStringLiteral("5"));
        QCOMPARE(datum()->text(), QString());
        QCOMPARE(txt("TxtMiniAnzT3")->text(), QString());
        QCOMPARE(godi->Seiten.size(), size_t(5));
    }

    void zuVieleMinisAufSeite()
    {
        setzeSeiten(*d, {seite("01.01.2003", "9.00", "2")});
        godi->MnuTermine_Click();
        tippe(datum(), QStringLiteral("5.1.03"));
        tippe(txt("TxtZeitT1"), QStringLiteral("18.00"));
        tippe(txt("TxtMiniAnzT1"), QStringLiteral("3"));
        tippe(txt("TxtMiniAnzT4"), QStringLiteral("41"));
        klicke(btn("BtnOK2"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungSeite});
        QCOMPARE(meldungen->gezeigt()[0].symbol, Symbol::Kritisch);
        // Date and times are taken, the counts not; the page closes all the same.
        QVERIFY(!godi->isVisible());
        QCOMPARE(d->AnzahlAusnahmen, int16_t(1));
        QCOMPARE(d->Ausnahmen[0].Datum, QStringLiteral("05.01.2003"));
        QCOMPARE(d->Ausnahmen[0].Zeit[0], QStringLiteral("18.00"));
        QCOMPARE(d->Ausnahmen[0].MiniAnz[0], QStringLiteral("2"));
        QCOMPARE(d->Ausnahmen[0].MiniAnz[3], QString());
    }

    void loeschenMitFrage()
    {
        setzeSeiten(*d, {seite("01.01.2003"), seite("02.01.2003"), seite("03.01.2003")});
        godi->MnuTermine_Click();
        klicke(btn("BtnRight2"));
        meldungen->antworte(Antwort::Nein);
        klicke(btn("BtnLöschen2"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(3));
        QCOMPARE(meldungen->gezeigt()[0].text, QStringLiteral("Soll Seite wirklich gelöscht werden?"));
        QCOMPARE(meldungen->gezeigt()[0].titel, QStringLiteral("Löschen"));
        QCOMPARE(meldungen->gezeigt()[0].knoepfe, Knoepfe::JaNein);
        klicke(btn("BtnLöschen2"));
        QCOMPARE(seitenDaten(), (QStringList{"01.01.2003", "03.01.2003"}));
        QCOMPARE(datum()->text(), QStringLiteral("03.01.2003"));
        klicke(btn("BtnLöschen2"));
        QCOMPARE(godi->AktuelleSeite, int16_t(0));
        QCOMPARE(datum()->text(), QStringLiteral("01.01.2003"));
        klicke(btn("BtnLöschen2"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(0));
        QCOMPARE(datum()->text(), QString());
        QVERIFY(!datum()->isEnabled());
        QVERIFY(!btn("BtnLöschen2")->isEnabled());
    }

    void alleSeitenLoeschen()
    {
        setzeSeiten(*d, {seite("01.01.2003", "9.00"), seite("02.01.2003")});
        godi->MnuTermine_Click();
        meldungen->antworte(Antwort::Nein);
        klicke(btn("BtnAlleLöschen"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(2));
        klicke(btn("BtnAlleLöschen"));
        QCOMPARE(meldungen->gezeigt()[1].text, QStringLiteral("Sollen wirklich alle Seiten gelöscht werden?"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(0));
        QCOMPARE(datum()->text(), QString());
        QCOMPARE(txt("TxtZeitT1")->text(), QString());
        QVERIFY(!datum()->isEnabled());
        klicke(btn("BtnOK2"));
        QCOMPARE(d->AnzahlAusnahmen, int16_t(0));
    }

    void okSortiertNachDatumstext()
    {
        godi->MnuTermine_Click();
        for (const char *t : {"24.3.02", "1.12.2002", "15.06.02", "05.01.2003", "6.12.02"}) {
            klicke(btn("BtnHinzufügen2"));
            tippe(datum(), QString::fromUtf8(t));
        }
        klicke(btn("BtnOK2"));
        QVERIFY(meldungen->gezeigt().empty());
        QCOMPARE(gespeicherteDaten(),
                 (QStringList{"01.12.2002", "05.01.2003", "06.12.2002", "15.06.2002", "24.03.2002"}));
        QCOMPARE(d->Ausnahmen.size(), size_t(6));
    }

    void sortiereTerminOrdnetBeliebigeListen()
    {
        const QStringList texte{"01.01.2003", "31.12.2002", "", "15.06.2002", "01.01.2003", "10.10.2010", "09.09.1999"};
        for (int n = 1; n <= 40; ++n) {
            std::vector<AusnahmeSeite> seiten;
            QStringList erwartet;
            for (int i = 0; i < n; ++i) {
                const QString t = texte[(i * 5 + n) % texte.size()];
                seiten.push_back(seite(t, QString::number(i)));
                erwartet << t;
            }
            setzeSeiten(*d, seiten);
            std::sort(erwartet.begin(), erwartet.end());
            godi->SortiereTermin(0, n - 1);
            QCOMPARE(gespeicherteDaten(), erwartet);
        }
    }

    void abbrechenLaesstSeitenUnveraendert()
    {
        setzeSeiten(*d, {seite("01.01.2003", "9.00", "2"), seite("02.01.2003")});
        d->Regulaer[1].Zeit[0] = QStringLiteral("10.00");
        godi->MnuTermine_Click();
        tippe(zeit(1, 1), QStringLiteral("11.00"));
        klicke(btn("BtnHinzufügen2"));
        klicke(btn("BtnLöschen2"));
        klicke(btn("BtnLöschen2"));
        klicke(btn("BtnAbbruch2"));
        QVERIFY(!godi->isVisible());
        QCOMPARE(fenster->aufrufe, (QStringList{"MenueDeaktivieren", "MenueAktivieren"}));
        QVERIFY(!d->Geaendert);
        QCOMPARE(d->Regulaer[1].Zeit[0], QStringLiteral("10.00"));
        QCOMPARE(gespeicherteDaten(), (QStringList{"01.01.2003", "02.01.2003"}));

        godi->MnuTermine_Click();
        QCOMPARE(zeit(1, 1)->text(), QStringLiteral("10.00"));
        QCOMPARE(godi->AnzahlSeiten, int16_t(2));
        QCOMPARE(datum()->text(), QStringLiteral("01.01.2003"));
        QCOMPARE(txt("TxtMiniAnzT1")->text(), QStringLiteral("2"));
        QVERIFY(datum()->isEnabled());
    }

    void seitePasstInsHauptfenster()
    {
        QVERIFY(godi->minimumSizeHint().width() <= 613);
        QVERIFY(godi->minimumSizeHint().height() <= 369);
        godi->MnuTermine_Click();
        QCOMPARE(abgeschnitteneBeschriftungen(godi), QStringList());
    }
};

QTEST_MAIN(TestFrameGodi)
#include "tst_framegodi.moc"
