#include "ui/FrameMinis.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"
#include "support_seiten.h"
#include "ui/Cp1252Eingabe.h"

#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QGuiApplication>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRandomGenerator>
#include <QTest>

#include <algorithm>
#include <memory>

namespace {

Mini mini(const QString &name, const QString &vorname, const QStringList &termine = {})
{
    Mini m;
    m.Name = name;
    m.Vorname = vorname;
    m.Strasse = name + QStringLiteral("weg 1");
    m.Ort = QStringLiteral("12345 Irgendwo");
    m.Telefon = QStringLiteral("0123/") + vorname;
    for (int k = 0; k < termine.size(); ++k)
        m.Termine[k] = termine[k];
    m.AnzahlTermine = int16_t(termine.size());
    return m;
}

void setzeRoster(InitMini &d, const std::vector<Mini> &minis)
{
    d.Minis = minis;
    d.Minis.emplace_back();
    d.AnzahlMinis = int16_t(minis.size());
    d.Sperre.assign(d.Minis.size(), 0);
    d.Einsaetze.assign(d.Minis.size(), 0);
}

const QString MeldungUngueltig = QStringLiteral(
    "Sie haben ungültige Werte bei 'Termine' eingegeben. Diese wurden nicht übernommen. Bitte überprüfen Sie Ihre "
    "zuletzt bearbeitete Seite.");
const QString MeldungZuViele = QStringLiteral(
    "Sie haben die Maximalzahl von 'Weitere Termine ...' überschritten. Diese beträgt  30. Die Werte wurden nicht "
    "übernommen!  Dies kann daran liegen, daß Sie alte Termine nicht gelöscht haben. Bitte überprüfen Sie Ihre "
    "zuletzt bearbeitete Seite!");

} // namespace

class TestFrameMinis : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<InitMini> d;
    std::unique_ptr<TestMeldungen> meldungen;
    std::unique_ptr<SeitenHauptfenster> fenster;
    FrameMinis *seite = nullptr;

    QLineEdit *txt(const char *name) { return kind<QLineEdit>(seite, QString::fromUtf8(name)); }
    QPushButton *btn(const char *name) { return kind<QPushButton>(seite, QString::fromUtf8(name)); }
    QCheckBox *check(const char *name) { return kind<QCheckBox>(seite, QString::fromUtf8(name)); }
    QComboBox *cmb() { return kind<QComboBox>(seite, QStringLiteral("CmbTermine")); }

    void oeffne()
    {
        seite->MnuListe_Click();
        QVERIFY(seite->isVisible());
    }
    QString gezeigterName() { return txt("TxtName")->text(); }

private slots:
    void init()
    {
        d = std::make_unique<InitMini>();
        meldungen = std::make_unique<TestMeldungen>();
        fenster = std::make_unique<SeitenHauptfenster>();
        seite = new FrameMinis(*d, *meldungen, *fenster);
        fenster->nimmSeite(seite);
        fenster->show();
        QVERIFY(QTest::qWaitForWindowExposed(fenster.get()));
    }
    void cleanup() { fenster.reset(); }

    void leererRosterNurHinzufuegenOKAbbruch()
    {
        // A roster shown earlier must not shine through when the page opens on an empty one.
        setzeRoster(*d, {mini(QStringLiteral("Alt"), QStringLiteral("Otto"))});
        oeffne();
        klicke(btn("BtnAbbruch"));
        d->AnzahlMinis = 0;
        seite->DatenGeladen();
        fenster->aufrufe.clear();

        oeffne();
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QCOMPARE(gezeigterName(), QString());
        QCOMPARE(txt("TxtTelefon")->text(), QString());
        QCOMPARE(cmb()->count(), 0);
        for (const char *aus : {"TxtName", "TxtOrt", "BtnLöschen", "BtnLeft", "BtnEnd", "BtnSuchkriterien",
                                "BtnSuchen", "CheckOmi", "CheckSonntag", "CmbTermine", "LabStrasse"})
            QVERIFY2(!seite->findChild<QWidget *>(QString::fromUtf8(aus))->isEnabled(), aus);
        for (const char *an : {"BtnHinzufügen", "BtnOK", "BtnAbbruch", "Label1", "Label2"})
            QVERIFY2(seite->findChild<QWidget *>(QString::fromUtf8(an))->isEnabled(), an);
        QCOMPARE(fenster->focusWidget(), btn("BtnHinzufügen"));

        klicke(btn("BtnOK"));
        QVERIFY(!seite->isVisible());
        QCOMPARE(d->AnzahlMinis, int16_t(0));
        QVERIFY(d->Geaendert);
        QCOMPARE(fenster->aufrufe.last(), QStringLiteral("MenueAktivieren"));
    }

    void datensatzTippenWegblaetternZurueck()
    {
        oeffne();
        klicke(btn("BtnHinzufügen"));
        QVERIFY(txt("TxtName")->isEnabled());
        QVERIFY(!btn("BtnSuchen")->isEnabled());
        tippe(txt("TxtName"), QStringLiteral("Müller"));
        tippe(txt("TxtVorname"), QStringLiteral("Jörg"));
        tippe(txt("TxtStrasse"), QStringLiteral("Hauptstraße 5"));
        tippe(txt("TxtOrt"), QStringLiteral("12345 Köln"));
        tippe(txt("TxtTelefon"), QStringLiteral("0221 „privat“"));
        klicke(check("CheckOmi"));
        klicke(check("CheckMontag"));
        klicke(check("CheckSonntag"));
        tippe(cmb(), QStringLiteral("2.1.03-5.1.03"));
        drueckeEnter(cmb());
        QCOMPARE(cmb()->lineEdit()->text(), QString());
        tippe(cmb(), QStringLiteral("24.12.02"));
        drueckeEnter(cmb());
        tippe(cmb(), QStringLiteral("1.5.03-1.5.03"));
        drueckeEnter(cmb());
        QCOMPARE(eintraege(cmb()), (QStringList{"2.1.03-5.1.03", "24.12.02", "1.5.03-1.5.03"}));

        klicke(btn("BtnHinzufügen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(2));
        QCOMPARE(seite->AktMini, int16_t(1));
        QCOMPARE(gezeigterName(), QString());
        QVERIFY(!check("CheckOmi")->isChecked());
        QCOMPARE(cmb()->count(), 0);
        tippe(txt("TxtName"), QStringLiteral("Zweiter"));

        klicke(btn("BtnLeft"));
        QVERIFY(meldungen->gezeigt().empty());
        QCOMPARE(seite->AktMini, int16_t(0));
        QCOMPARE(gezeigterName(), QStringLiteral("Müller"));
        QCOMPARE(txt("TxtVorname")->text(), QStringLiteral("Jörg"));
        QCOMPARE(txt("TxtStrasse")->text(), QStringLiteral("Hauptstraße 5"));
        QCOMPARE(txt("TxtOrt")->text(), QStringLiteral("12345 Köln"));
        QCOMPARE(txt("TxtTelefon")->text(), QStringLiteral("0221 „privat“"));
        QVERIFY(check("CheckOmi")->isChecked());
        QVERIFY(!check("CheckNicht")->isChecked());
        QVERIFY(check("CheckMontag")->isChecked());
        QVERIFY(check("CheckSonntag")->isChecked());
        QVERIFY(!check("CheckSamstag")->isChecked());
        const QStringList normal{"02.01.2003-05.01.2003", "24.12.2002", "01.05.2003-01.05.2003"};
        QCOMPARE(eintraege(cmb()), normal);
        // The last entry stands in the edit field after the page was filled.
        QCOMPARE(cmb()->lineEdit()->text(), normal.last());

        const Mini &r = seite->MinisKopie[0];
        QCOMPARE(r.AnzahlTermine, int16_t(3));
        QCOMPARE(r.Termine[1], QStringLiteral("24.12.2002"));
        QVERIFY(r.Ausgenommen[1] && r.Ausgenommen[2] && !r.Ausgenommen[7]);
        QVERIFY(r.Oberministrant);

        klicke(btn("BtnRight"));
        QCOMPARE(gezeigterName(), QStringLiteral("Zweiter"));
    }

    void ungueltigeTermineBehaltenAlteWerte_data()
    {
        QTest::addColumn<QString>("eintrag");
        QTest::newRow("kein Datum") << QStringLiteral("Ostern");
        QTest::newRow("Ende vor Anfang") << QStringLiteral("5.1.03-2.1.03");
        QTest::newRow("Strich vorn") << QStringLiteral("-1.5.03");
        QTest::newRow("31. Februar") << QStringLiteral("31.02.2003");
    }
    void ungueltigeTermineBehaltenAlteWerte()
    {
        QFETCH(QString, eintrag);
        setzeRoster(*d, {mini("A", "Anna", {"01.01.2003", "02.01.2003"}), mini("B", "Bert")});
        oeffne();
        // Reorder the list: drop the first entry, add a valid one and then the faulty one.
        waehleEintrag(cmb(), 0);
        tippe(cmb(), QString());
        QCOMPARE(eintraege(cmb()), QStringList{"02.01.2003"});
        tippe(cmb(), QStringLiteral("3.1.03"));
        drueckeEnter(cmb());
        tippe(cmb(), eintrag);
        drueckeEnter(cmb());
        tippe(txt("TxtVorname"), QStringLiteral("Annette"));

        klicke(btn("BtnRight"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungUngueltig});
        QCOMPARE(meldungen->gezeigt()[0].titel, QStringLiteral("Fehler in Anwendung"));
        QCOMPARE(meldungen->gezeigt()[0].symbol, Symbol::Keins);
        QCOMPARE(meldungen->gezeigt()[0].knoepfe, Knoepfe::OK);
        // The browsing goes on; the other fields were stored, the dates stay as they were.
        QCOMPARE(gezeigterName(), QStringLiteral("B"));
        const Mini &a = seite->MinisKopie[0];
        QCOMPARE(a.Vorname, QStringLiteral("Annette"));
        QCOMPARE(a.AnzahlTermine, int16_t(2));
        QCOMPARE(a.Termine[0], QStringLiteral("01.01.2003"));
        QCOMPARE(a.Termine[1], QStringLiteral("02.01.2003"));
    }

    void dreissigTermineJaEinunddreissigNein()
    {
        setzeRoster(*d, {mini("A", "Anna", {"01.01.2003"}), mini("B", "Bert")});
        oeffne();
        for (int k = 2; k <= 30; ++k) {
            tippe(cmb(), QStringLiteral("%1.3.04").arg(k));
            drueckeEnter(cmb());
        }
        QCOMPARE(cmb()->count(), 30);
        klicke(btn("BtnRight"));
        QVERIFY(meldungen->gezeigt().empty());
        QCOMPARE(seite->MinisKopie[0].AnzahlTermine, int16_t(30));
        QCOMPARE(seite->MinisKopie[0].Termine[29], QStringLiteral("30.03.2004"));

        klicke(btn("BtnLeft"));
        tippe(cmb(), QStringLiteral("31.3.04"));
        drueckeEnter(cmb());
        tippe(txt("TxtName"), QStringLiteral("Anders"));
        klicke(btn("BtnRight"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungZuViele});
        QCOMPARE(meldungen->gezeigt()[0].symbol, Symbol::Kritisch);
        QCOMPARE(meldungen->gezeigt()[0].titel, QStringLiteral("Fehler in Anwendung"));
        QCOMPARE(seite->MinisKopie[0].Name, QStringLiteral("Anders"));
        QCOMPARE(seite->MinisKopie[0].AnzahlTermine, int16_t(30));
        QCOMPARE(gezeigterName(), QStringLiteral("B"));
    }

    void leererEintragSpeichertLeerenText()
    {
        setzeRoster(*d, {mini("A", "Anna", {"01.01.2003"}), mini("B", "Bert")});
        oeffne();
        // Erase the only entry, then press Enter on the empty field: one empty entry.
        waehleEintrag(cmb(), 0);
        tippe(cmb(), QString());
        QCOMPARE(cmb()->count(), 0);
        drueckeEnter(cmb());
        QCOMPARE(eintraege(cmb()), QStringList{QString()});
        klicke(btn("BtnRight"));
        klicke(btn("BtnLeft"));
        QVERIFY(meldungen->gezeigt().empty());
        QCOMPARE(seite->MinisKopie[0].AnzahlTermine, int16_t(1));
        QCOMPARE(seite->MinisKopie[0].Termine[0], QString());
        QCOMPARE(eintraege(cmb()), QStringList{QString()});
    }

    void blaetternOhneUmlauf()
    {
        setzeRoster(*d, {mini("A", "1"), mini("B", "2"), mini("C", "3")});
        oeffne();
        klicke(btn("BtnLeft"));
        QCOMPARE(gezeigterName(), QStringLiteral("A"));
        QCOMPARE(fenster->focusWidget(), txt("TxtName"));
        klicke(btn("BtnEnd"));
        QCOMPARE(gezeigterName(), QStringLiteral("C"));
        klicke(check("CheckNicht"));
        klicke(btn("BtnRight"));
        QCOMPARE(gezeigterName(), QStringLiteral("C"));
        // At the last record "Vor" stores nothing; the tick is still only on screen.
        QVERIFY(!seite->MinisKopie[2].NichtEinteilen);
        klicke(btn("BtnEnd"));
        QVERIFY(seite->MinisKopie[2].NichtEinteilen);
        klicke(btn("BtnBegin"));
        QCOMPARE(gezeigterName(), QStringLiteral("A"));
        klicke(btn("BtnRight"));
        QCOMPARE(gezeigterName(), QStringLiteral("B"));
        QVERIFY(meldungen->gezeigt().empty());
    }

    void hinzufuegenUndLoeschenAnDenEnden()
    {
        setzeRoster(*d, {mini("A", "1"), mini("B", "2"), mini("C", "3")});
        oeffne();
        tippe(txt("TxtOrt"), QStringLiteral("Neuort"));
        klicke(btn("BtnHinzufügen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(4));
        QCOMPARE(seite->AktMini, int16_t(3));
        QCOMPARE(seite->MinisKopie[0].Ort, QStringLiteral("Neuort"));
        QCOMPARE(gezeigterName(), QString());
        QCOMPARE(seite->MinisKopie.size(), size_t(5));

        // Deleting the last record shows the new last one; the unstored edit is lost.
        tippe(txt("TxtName"), QStringLiteral("Weg"));
        meldungen->antworte(Antwort::Nein);
        klicke(btn("BtnLöschen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(4));
        QCOMPARE(meldungen->gezeigt().back().text, QStringLiteral("Soll Seite wirklich gelöscht werden?"));
        QCOMPARE(meldungen->gezeigt().back().titel, QStringLiteral("Löschen"));
        QCOMPARE(meldungen->gezeigt().back().knoepfe, Knoepfe::JaNein);
        QCOMPARE(meldungen->gezeigt().back().symbol, Symbol::Keins);
        klicke(btn("BtnLöschen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(3));
        QCOMPARE(seite->AktMini, int16_t(2));
        QCOMPARE(gezeigterName(), QStringLiteral("C"));

        // Deleting the first record moves the others down.
        klicke(btn("BtnBegin"));
        klicke(btn("BtnLöschen"));
        QCOMPARE(seite->AktMini, int16_t(0));
        QCOMPARE(gezeigterName(), QStringLiteral("B"));
        QCOMPARE(seite->MinisKopie[1].Name, QStringLiteral("C"));
        QCOMPARE(seite->MinisKopie.size(), size_t(3));
        QCOMPARE(seite->MinisKopie[2].Name, QString());

        klicke(btn("BtnLöschen"));
        klicke(btn("BtnLöschen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(0));
        QCOMPARE(gezeigterName(), QString());
        QVERIFY(!txt("TxtName")->isEnabled());
        QVERIFY(!btn("BtnLöschen")->isEnabled());
        QVERIFY(btn("BtnHinzufügen")->isEnabled());

        // The first record added again starts blank and enables the page.
        klicke(btn("BtnHinzufügen"));
        QVERIFY(txt("TxtName")->isEnabled());
        QCOMPARE(gezeigterName(), QString());
        QCOMPARE(seite->MinisKopie[0].Name, QString());
    }

    void okSortiertNachNameUndVorname()
    {
        setzeRoster(*d, {mini("Meierhof", "Bert"), mini("Zander", "Zoe"), mini("de Vries", "Dirk"),
                         mini("Meier", "Anna")});
        d->Einsaetze = {10, 20, 30, 40, 0};
        d->Sperre = {1, 2, 3, 0, 0};
        oeffne();
        klicke(btn("BtnEnd"));
        klicke(btn("BtnHinzufügen"));
        tippe(txt("TxtName"), QStringLiteral("Ärger"));
        tippe(txt("TxtVorname"), QStringLiteral("Emil"));
        klicke(btn("BtnOK"));

        QVERIFY(!seite->isVisible());
        QCOMPARE(fenster->aufrufe, (QStringList{"MenueDeaktivieren", "MenueAktivieren"}));
        QVERIFY(d->Geaendert);
        QCOMPARE(d->AnzahlMinis, int16_t(5));
        QStringList namen;
        for (int i = 0; i < d->AnzahlMinis; ++i)
            namen << d->Minis[i].Name + u',' + d->Minis[i].Vorname;
        // Code-value order: capitals before small letters, umlauts after all of them.
        QCOMPARE(namen, (QStringList{"Meier,Anna", "Meierhof,Bert", "Zander,Zoe", "de Vries,Dirk", "Ärger,Emil"}));
        QCOMPARE(d->Minis.size(), size_t(6));
        // The counters stay at their indices and grow with the roster.
        QCOMPARE(d->Einsaetze, (std::vector<int16_t>{10, 20, 30, 40, 0, 0}));
        QCOMPARE(d->Sperre, (std::vector<int16_t>{1, 2, 3, 0, 0, 0}));
    }

    void sortiereOrdnetBeliebigeListen()
    {
        QRandomGenerator zufall(4711);
        const QStringList silben{"Ma", "ma", "Me", "Mü", "de ", "Z", "ß", "a", ""};
        for (int durchlauf = 0; durchlauf < 50; ++durchlauf) {
            const int n = 1 + zufall.bounded(40);
            std::vector<Mini> minis;
            for (int i = 0; i < n; ++i)
                minis.push_back(mini(silben[zufall.bounded(silben.size())] + silben[zufall.bounded(silben.size())],
                                     silben[zufall.bounded(silben.size())]));
            setzeRoster(*d, minis);
            QStringList erwartet;
            for (const Mini &m : minis)
                erwartet << m.Name + m.Vorname;
            std::sort(erwartet.begin(), erwartet.end());
            seite->Sortiere(0, n - 1);
            QStringList ist;
            for (int i = 0; i < n; ++i)
                ist << d->Minis[i].Name + d->Minis[i].Vorname;
            QCOMPARE(ist, erwartet);
        }
    }

    void abbruchVerwirftAlles()
    {
        setzeRoster(*d, {mini("A", "1", {"01.01.2003"}), mini("B", "2", {"02.02.2003"}), mini("C", "3")});
        oeffne();
        tippe(txt("TxtName"), QStringLiteral("Geändert"));
        klicke(btn("BtnAlleTermineLöschen"));
        QCOMPARE(meldungen->gezeigt().back().text, QStringLiteral("Sollen wirklich alle Termine gelöscht werden?"));
        QCOMPARE(meldungen->gezeigt().back().titel, QStringLiteral("Löschen"));
        // The shown page was not stored first: its record's values come back.
        QCOMPARE(gezeigterName(), QStringLiteral("A"));
        QCOMPARE(cmb()->count(), 0);
        QCOMPARE(seite->MinisKopie[1].AnzahlTermine, int16_t(0));
        QCOMPARE(seite->MinisKopie[1].Termine[0], QString());
        klicke(btn("BtnLöschen"));
        klicke(btn("BtnLöschen"));
        QCOMPARE(seite->AnzahlKopie, int16_t(1));
        klicke(btn("BtnAbbruch"));

        QVERIFY(!seite->isVisible());
        QCOMPARE(fenster->aufrufe.last(), QStringLiteral("MenueAktivieren"));
        QVERIFY(!d->Geaendert);
        QCOMPARE(d->AnzahlMinis, int16_t(3));
        QCOMPARE(d->Minis[1].Termine[0], QStringLiteral("02.02.2003"));

        // Reopening after deletions were cancelled holds the whole roster again.
        oeffne();
        QCOMPARE(seite->AnzahlKopie, int16_t(3));
        QCOMPARE(gezeigterName(), QStringLiteral("A"));
        QCOMPARE(eintraege(cmb()), QStringList{"01.01.2003"});
        klicke(btn("BtnEnd"));
        QCOMPARE(gezeigterName(), QStringLiteral("C"));
        klicke(btn("BtnHinzufügen"));
        QCOMPARE(gezeigterName(), QString());
        QCOMPARE(seite->MinisKopie[3].Strasse, QString());
    }

    void alleTermineLoeschenNurMitJa()
    {
        setzeRoster(*d, {mini("A", "1", {"01.01.2003"})});
        oeffne();
        meldungen->antworte(Antwort::Nein);
        klicke(btn("BtnAlleTermineLöschen"));
        QCOMPARE(eintraege(cmb()), QStringList{"01.01.2003"});
        QCOMPARE(seite->MinisKopie[0].AnzahlTermine, int16_t(1));
    }

    void suche_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("vorname");
        QTest::addColumn<QString>("gefunden");
        QTest::newRow("letzter Treffer gewinnt") << "mei" << "" << "Meier,Bernd";
        QTest::newRow("beide Kriterien") << "mei" << "a" << "Meier,Anna";
        QTest::newRow("nur Vorname") << "" << "c" << "Müller,Carla";
        QTest::newRow("Umlaut ohne Groß/klein") << "mü" << "" << "Müller,Carla";
        QTest::newRow("Blank am Ende trifft nicht") << "Meier " << "" << "Zoller,Zita";
        QTest::newRow("länger als das Feld") << "Meiers" << "" << "Zoller,Zita";
        QTest::newRow("beide leer") << "" << "" << "Zoller,Zita";
        QTest::newRow("Name trifft, Vorname nicht") << "Mü" << "x" << "Zoller,Zita";
    }
    void suche()
    {
        QFETCH(QString, name);
        QFETCH(QString, vorname);
        QFETCH(QString, gefunden);
        setzeRoster(*d, {mini("Meier", "Anna"), mini("Meier", "Bernd"), mini("Müller", "Carla"),
                         mini("Zoller", "Zita")});
        oeffne();
        klicke(btn("BtnEnd"));
        QCOMPARE(seite->AktMini, int16_t(3));
        klicke(btn("BtnSuchkriterien"));
        QCOMPARE(gezeigterName(), QString());
        QCOMPARE(txt("TxtStrasse")->text(), QString());
        QVERIFY(btn("BtnSuchen")->isEnabled());
        for (const char *aus : {"BtnOK", "BtnAbbruch", "BtnHinzufügen", "BtnSuchkriterien", "BtnLeft", "TxtStrasse",
                                "LabTelefon", "CmbTermine", "CheckNicht"})
            QVERIFY2(!seite->findChild<QWidget *>(QString::fromUtf8(aus))->isEnabled(), aus);
        QVERIFY(txt("TxtName")->isEnabled() && txt("TxtVorname")->isEnabled());

        tippe(txt("TxtName"), name);
        tippe(txt("TxtVorname"), vorname);
        klicke(btn("BtnSuchen"));
        QCOMPARE(gezeigterName() + u',' + txt("TxtVorname")->text(), gefunden);
        QCOMPARE(txt("TxtStrasse")->text(), gefunden.section(u',', 0, 0) + QStringLiteral("weg 1"));
        QVERIFY(!btn("BtnSuchen")->isEnabled());
        QVERIFY(btn("BtnOK")->isEnabled() && btn("BtnSuchkriterien")->isEnabled() && txt("TxtOrt")->isEnabled());
        // The criteria never end up in a record.
        QCOMPARE(seite->MinisKopie[3].Name, QStringLiteral("Zoller"));
        QVERIFY(meldungen->gezeigt().empty());
    }

    void suchkriterienNachUngueltigemTermin()
    {
        setzeRoster(*d, {mini("Meier", "Anna"), mini("Müller", "Carla")});
        oeffne();
        tippe(cmb(), QStringLiteral("Pfingsten"));
        drueckeEnter(cmb());
        klicke(btn("BtnSuchkriterien"));
        QCOMPARE(meldungen->texte(), QStringList{MeldungUngueltig});
        QVERIFY(btn("BtnSuchen")->isEnabled());
        QCOMPARE(cmb()->count(), 0);
        tippe(txt("TxtName"), QStringLiteral("MÜ"));
        klicke(btn("BtnSuchen"));
        QCOMPARE(gezeigterName(), QStringLiteral("Müller"));
    }

    void terminListeBearbeiten()
    {
        setzeRoster(*d, {mini("A", "1", {"01.01.2003", "02.01.2003", "03.01.2003"})});
        oeffne();
        QCOMPARE(cmb()->lineEdit()->text(), QStringLiteral("03.01.2003"));
        // Right after filling, typing replaces nothing; Enter appends even a duplicate.
        tippe(cmb(), QStringLiteral("01.01.2003"));
        QCOMPARE(cmb()->count(), 3);
        drueckeEnter(cmb());
        QCOMPARE(eintraege(cmb()), (QStringList{"01.01.2003", "02.01.2003", "03.01.2003", "01.01.2003"}));
        QCOMPARE(cmb()->lineEdit()->text(), QString());

        // Picking an entry and typing: the first keystroke removes it, Enter appends the new text.
        waehleEintrag(cmb(), 1);
        QCOMPARE(cmb()->lineEdit()->text(), QStringLiteral("02.01.2003"));
        QCOMPARE(cmb()->count(), 4);
        cmb()->lineEdit()->end(false);
        QTest::keyClick(cmb()->lineEdit(), Qt::Key_Backspace);
        QCOMPARE(eintraege(cmb()), (QStringList{"01.01.2003", "03.01.2003", "01.01.2003"}));
        QCOMPARE(cmb()->lineEdit()->text(), QStringLiteral("02.01.200"));
        QTest::keyClicks(cmb()->lineEdit(), QStringLiteral("4"));
        QCOMPARE(cmb()->count(), 3);
        drueckeEnter(cmb());
        QCOMPARE(eintraege(cmb()), (QStringList{"01.01.2003", "03.01.2003", "01.01.2003", "02.01.2004"}));

        // Picking an entry and erasing its text deletes it.
        waehleEintrag(cmb(), 2);
        tippe(cmb(), QString());
        QCOMPARE(eintraege(cmb()), (QStringList{"01.01.2003", "03.01.2003", "02.01.2004"}));
        QCOMPARE(cmb()->lineEdit()->text(), QString());

        // Picking and pressing Enter at once moves the entry to the end.
        waehleEintrag(cmb(), 0);
        drueckeEnter(cmb());
        QCOMPARE(eintraege(cmb()), (QStringList{"03.01.2003", "02.01.2004", "01.01.2003"}));

        klicke(btn("BtnOK"));
        QCOMPARE(d->Minis[0].AnzahlTermine, int16_t(3));
        QCOMPARE(d->Minis[0].Termine[1], QStringLiteral("02.01.2004"));
    }

    void nurWindows1252Zeichen()
    {
        setzeRoster(*d, {mini("A", "1")});
        oeffne();
        QLineEdit *name = txt("TxtName");
        tippe(name, QStringLiteral("Łukasz €"));
        QCOMPARE(name->text(), QStringLiteral("ukasz €"));
        QGuiApplication::clipboard()->setText(QStringLiteral("Zeile\nzwei"));
        name->selectAll();
        name->paste();
        QCOMPARE(name->text(), QStringLiteral("ukasz €"));
        QGuiApplication::clipboard()->setText(QStringLiteral("Dvořák"));
        name->paste();
        QCOMPARE(name->text(), QStringLiteral("ukasz €"));
        QGuiApplication::clipboard()->setText(QStringLiteral("„Grüße“ – ß"));
        name->selectAll();
        name->paste();
        QCOMPARE(name->text(), QStringLiteral("„Grüße“ – ß"));
        tippe(cmb(), QStringLiteral("1.1.03→"));
        QCOMPARE(cmb()->lineEdit()->text(), QStringLiteral("1.1.03"));

        Cp1252Eingabe pruefer;
        for (char16_t zeichen : {u'\t', u'\r', char16_t(0x81), char16_t(0x7F), char16_t(0x0141), char16_t(0x2192)})
            QVERIFY(!Cp1252Eingabe::IstErlaubt(QChar(zeichen)));
        for (char16_t zeichen : {u' ', u'~', char16_t(0xA0), char16_t(0xFF), char16_t(0x20AC), char16_t(0x0178)})
            QVERIFY(Cp1252Eingabe::IstErlaubt(QChar(zeichen)));
    }

    void seitePasstInsHauptfenster()
    {
        QVERIFY(seite->minimumSizeHint().width() <= 613);
        QVERIFY(seite->minimumSizeHint().height() <= 369);
        setzeRoster(*d, {mini("A", "1")});
        oeffne();
        QCOMPARE(abgeschnitteneBeschriftungen(seite), QStringList());
    }
};

QTEST_MAIN(TestFrameMinis)
#include "tst_frameminis.moc"
