// The file commands of the main window: open, save, save under a new name and quit, with their
// questions, flags, toolbar images and titles, through the real file browser.
#include "support_umgebung.h"

#include "ui/FormFileBrw.h"
#include "ui/FormMinis.h"

#include <QDir>
#include <QFile>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QTest>

namespace {

// Types a name into the open browser and clicks OK.
void BrowserOK(const QString &name)
{
    auto *browser = OffenesFenster<FormFileBrw>();
    QVERIFY(browser);
    browser->findChild<QLineEdit *>("TxtDatei")->setText(name);
    QTest::mouseClick(browser->findChild<QPushButton *>("CmdOK"), Qt::LeftButton);
}

const QString Frage = QStringLiteral("Sollen Änderungen in %1 gesichert werden?");

} // namespace

class TestDateibefehle : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { Aufraeumen(); }

    void oeffnenOhneAenderungen();
    void oeffnenMitAenderungenJa();
    void oeffnenMitAenderungenNein();
    void oeffnenMitAenderungenJaUndFehlschlagLaedtNicht();
    void oeffnenFehlendeDatei();
    void oeffnenMitMuster();
    void oeffnenKeineDatendatei();
    void oeffnenAbbruchAendertNichts();
    void speichernOhneAenderungSchreibtNichts();
    void speichernMitAenderung();
    void speichernUnterSchreibtImmerUndSetztTitel();
    void beendenOhneAenderungen();
    void beendenMitAenderungen_data();
    void beendenMitAenderungen();
    void beendenJaMitFehlschlagBleibtOffen();
    void schliessfeldWieProgrammBeenden();
    void schliessfeldWaehrendSekundaerfensterWirkungslos();
};

void TestDateibefehle::oeffnenOhneAenderungen()
{
    Testumgebung t;
    SchreibeBeispiel(t.pfad("pfarrei.prd"), Beispieldaten({"Abel", "Berg"}));
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuLaden"));
    QVERIFY(f->Daten().DateiLaden);
    QVERIFY(!f->isEnabled());
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Down"));
    QCOMPARE(OffenesFenster<FormFileBrw>()->windowTitle(), QString("Datei öffnen"));

    BrowserOK("pfarrei.prd");
    QVERIFY(t.meldungen.gezeigt().empty());
    QVERIFY(!OffenesFenster<FormFileBrw>());
    QVERIFY(f->isEnabled());
    QCOMPARE(f->Daten().AnzahlMinis, int16_t(2));
    QCOMPARE(f->Daten().Minis[1].Name, QString("Berg"));
    QCOMPARE(f->Daten().Dateiname, QDir::toNativeSeparators(t.pfad("pfarrei.prd")));
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + f->Daten().Dateiname.toUpper());
    QVERIFY(!f->Daten().DateiLaden);
    QVERIFY(!f->Daten().Geaendert);
    // Loaded servers enable the save group; without a plan the view stays off.
    QVERIFY(Erreichbar(*f, "MnuSpeichern"));
    QVERIFY(MenueAn(*f, "MnuAusführen"));
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Dis"));
}

void TestDateibefehle::oeffnenMitAenderungenJa()
{
    Testumgebung t;
    SchreibeBeispiel(t.pfad("neu.prd"), Beispieldaten({"Neu"}));
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Alt"});
    f->Daten().Dateiname = t.pfad("alt.prd");
    f->Daten().Geaendert = true;
    QVERIFY(Waehle(*f, "MnuLaden"));
    t.meldungen.antworte(Antwort::Ja);
    BrowserOK("neu.prd");

    QCOMPARE(t.meldungen.texte(), QStringList{Frage.arg(t.pfad("alt.prd").toUpper())});
    QCOMPARE(t.meldungen.titel(), QStringList{"Datei öffnen"});
    QCOMPARE(t.meldungen.gezeigt().front().knoepfe, Knoepfe::JaNein);
    QVERIFY(Dateizeilen(t.pfad("alt.prd")).contains("Alt"));
    QCOMPARE(f->Daten().Minis[0].Name, QString("Neu"));
    QVERIFY(!f->Daten().Geaendert);
}

void TestDateibefehle::oeffnenMitAenderungenNein()
{
    Testumgebung t;
    SchreibeBeispiel(t.pfad("neu.prd"), Beispieldaten({"Neu"}));
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Alt"});
    f->Daten().Dateiname = t.pfad("alt.prd");
    f->Daten().Geaendert = true;
    QVERIFY(Waehle(*f, "MnuLaden"));
    t.meldungen.antworte(Antwort::Nein);
    BrowserOK("neu.prd");

    QCOMPARE(t.meldungen.gezeigt().size(), size_t(1));
    QVERIFY(!QFile::exists(t.pfad("alt.prd")));
    QCOMPARE(f->Daten().Minis[0].Name, QString("Neu"));
    QVERIFY(!f->Daten().Geaendert);
    // The discarded changes are not asked for again.
    QVERIFY(Waehle(*f, "MnuLaden"));
    BrowserOK("neu.prd");
    QCOMPARE(t.meldungen.gezeigt().size(), size_t(1));
}

void TestDateibefehle::oeffnenMitAenderungenJaUndFehlschlagLaedtNicht()
{
    Testumgebung t;
    SchreibeBeispiel(t.pfad("neu.prd"), Beispieldaten({"Neu"}));
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Alt"});
    f->Daten().Dateiname = t.pfad("fehlt/alt.prd");
    f->Daten().Geaendert = true;
    QVERIFY(Waehle(*f, "MnuLaden"));
    t.meldungen.antworte(Antwort::Ja);
    BrowserOK("neu.prd");

    // The save failed: the unsaved data must not be replaced.
    QCOMPARE(t.meldungen.titel(), (QStringList{"Datei öffnen", "Fehler beim Sichern"}));
    QCOMPARE(f->Daten().Minis[0].Name, QString("Alt"));
    QVERIFY(f->Daten().Geaendert);
    QCOMPARE(f->Daten().Dateiname, t.pfad("fehlt/alt.prd"));
    QVERIFY(OffenesFenster<FormFileBrw>());
    OffenesFenster<FormFileBrw>()->close();
}

void TestDateibefehle::oeffnenFehlendeDatei()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Alt"});
    f->Daten().Geaendert = true;
    const QString vorher = f->Daten().Dateiname;
    QVERIFY(Waehle(*f, "MnuLaden"));
    t.meldungen.antworte(Antwort::Nein);
    BrowserOK("gibtsnicht.prd");

    QCOMPARE(t.meldungen.titel(), (QStringList{"Datei öffnen", "Ungültiger Dateiname"}));
    QCOMPARE(t.meldungen.texte().last(),
             QString("Datei befindet sich nicht in diesem Verzeichnis oder der Dateiname ist ungültig!"));
    QCOMPARE(t.meldungen.gezeigt().back().symbol, Symbol::Kritisch);
    // The dialog stays open; nothing was loaded, so the changes are still unsaved.
    QVERIFY(OffenesFenster<FormFileBrw>());
    QVERIFY(!f->isEnabled());
    QVERIFY(f->Daten().Geaendert);
    QCOMPARE(f->Daten().Dateiname, vorher);
    QCOMPARE(f->Daten().Minis[0].Name, QString("Alt"));
    QTest::mouseClick(OffenesFenster<FormFileBrw>()->findChild<QPushButton *>("CmdAbbruch"), Qt::LeftButton);
    QVERIFY(f->isEnabled());
}

void TestDateibefehle::oeffnenMitMuster()
{
    Testumgebung t;
    SchreibeBeispiel(t.pfad("b.prd"), Beispieldaten({"Bert"}));
    SchreibeBeispiel(t.pfad("a.prd"), Beispieldaten({"Anna"}));
    QFile andere(t.pfad("0.txt"));
    QVERIFY(andere.open(QIODevice::WriteOnly));
    andere.close();
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuLaden"));
    // The name box holds the pattern "*.prd" from the start.
    BrowserOK(OffenesFenster<FormFileBrw>()->findChild<QLineEdit *>("TxtDatei")->text());
    QVERIFY(t.meldungen.gezeigt().empty());
    QCOMPARE(f->Daten().Minis[0].Name, QString("Anna"));
    QCOMPARE(f->Daten().Dateiname, QDir::toNativeSeparators(t.pfad("a.prd")));

    // Without a data file in the folder the pattern finds nothing.
    QVERIFY(QFile::remove(t.pfad("a.prd")) && QFile::remove(t.pfad("b.prd")));
    QVERIFY(Waehle(*f, "MnuLaden"));
    BrowserOK("*.prd");
    QCOMPARE(t.meldungen.titel(), QStringList{"Ungültiger Dateiname"});
    OffenesFenster<FormFileBrw>()->close();
}

void TestDateibefehle::oeffnenKeineDatendatei()
{
    Testumgebung t;
    QFile fremd(t.pfad("fremd.prd"));
    QVERIFY(fremd.open(QIODevice::WriteOnly));
    fremd.write("pradilon\r\n 0 \r\n");
    fremd.close();
    auto f = NeuesHauptfenster(t);
    f->Daten().Dateiname = t.pfad("vorher.prd");
    QVERIFY(Waehle(*f, "MnuLaden"));
    BrowserOK("fremd.prd");

    QCOMPARE(t.meldungen.titel(), QStringList{"Fehler beim Öffnen"});
    QCOMPARE(t.meldungen.texte(),
             QStringList{"Dies ist keine Pradilon-Datei! Die Datei konnte nicht geöffnet werden! "});
    // The dialog closes as after a success; name and title are the old ones.
    QVERIFY(!OffenesFenster<FormFileBrw>());
    QCOMPARE(f->Daten().Dateiname, t.pfad("vorher.prd"));
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + t.pfad("vorher.prd").toUpper());
    QVERIFY(!Erreichbar(*f, "MnuSpeichern"));
}

void TestDateibefehle::oeffnenAbbruchAendertNichts()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Alt"});
    f->Daten().Geaendert = true;
    const QString vorher = f->Daten().Dateiname;
    QVERIFY(Waehle(*f, "MnuLaden"));
    QTest::keyClick(OffenesFenster<FormFileBrw>(), Qt::Key_Escape);
    QVERIFY(!OffenesFenster<FormFileBrw>());
    QVERIFY(t.meldungen.gezeigt().empty());
    QCOMPARE(f->Daten().Dateiname, vorher);
    QVERIFY(f->Daten().Geaendert);
    QCOMPARE(f->Daten().Minis[0].Name, QString("Alt"));
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
}

void TestDateibefehle::speichernOhneAenderungSchreibtNichts()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("nie.prd");
    f->MenueAktivieren();
    QVERIFY(Waehle(*f, "MnuSpeichern"));
    QTest::mouseClick(f->findChild<QWidget *>("ImSaveUp"), Qt::LeftButton);
    QVERIFY(!QFile::exists(t.pfad("nie.prd")));
    QVERIFY(t.meldungen.gezeigt().empty());
}

void TestDateibefehle::speichernMitAenderung()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("jetzt.prd");
    f->Daten().Geaendert = true;
    f->MenueAktivieren();
    QTest::mouseClick(f->findChild<QWidget *>("ImSaveUp"), Qt::LeftButton);
    QCOMPARE(Dateizeilen(t.pfad("jetzt.prd")).value(0), QString("pRaDiLoN"));
    QVERIFY(!f->Daten().Geaendert);
    QVERIFY(t.meldungen.gezeigt().empty());
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Up"));
}

void TestDateibefehle::speichernUnterSchreibtImmerUndSetztTitel()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});
    f->MenueAktivieren();
    QVERIFY(!f->Daten().Geaendert);
    QVERIFY(Waehle(*f, "MnuSpeichernUnter"));
    QVERIFY(f->Daten().DateiSpeichernUnter);
    QCOMPARE(OffenesFenster<FormFileBrw>()->windowTitle(), QString("Datei speichern unter"));
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Down"));
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
    BrowserOK("kopie.prd");

    QVERIFY(t.meldungen.gezeigt().empty());
    QVERIFY(Dateizeilen(t.pfad("kopie.prd")).contains("Abel"));
    QVERIFY(!f->Daten().Geaendert);
    QVERIFY(!f->Daten().DateiSpeichernUnter);
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + QDir::toNativeSeparators(t.pfad("kopie.prd")).toUpper());
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Up"));
    QVERIFY(f->isEnabled());

    // A pattern is no name to save under.
    QVERIFY(Waehle(*f, "MnuSpeichernUnter"));
    BrowserOK("*.prd");
    QCOMPARE(t.meldungen.titel(), QStringList{"Ungültiger Dateiname"});
    QVERIFY(!QFile::exists(t.pfad("*.prd")));
    OffenesFenster<FormFileBrw>()->close();
}

void TestDateibefehle::beendenOhneAenderungen()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QSignalSpy ende(f.get(), &FormMinis::ProgrammEnde);
    t.meldungen.antworte(Antwort::Nein);
    QVERIFY(Waehle(*f, "MnuProgrammBeenden"));
    QCOMPARE(t.meldungen.texte(), QStringList{"Soll das Programm beendet werden?"});
    QCOMPARE(t.meldungen.titel(), QStringList{"Programm beenden"});
    QCOMPARE(t.meldungen.gezeigt().front().knoepfe, Knoepfe::JaNein);
    QCOMPARE(ende.count(), 0);
    QVERIFY(f->isVisible());

    t.meldungen.antworte(Antwort::Ja);
    QVERIFY(Waehle(*f, "MnuProgrammBeenden"));
    QCOMPARE(ende.count(), 1);
    QVERIFY(!f->isVisible());
}

void TestDateibefehle::beendenMitAenderungen_data()
{
    QTest::addColumn<Antwort>("antwort");
    QTest::addColumn<bool>("beendet");
    QTest::addColumn<bool>("geschrieben");
    QTest::newRow("Ja") << Antwort::Ja << true << true;
    QTest::newRow("Nein") << Antwort::Nein << true << false;
    QTest::newRow("Abbrechen") << Antwort::Abbrechen << false << false;
}

void TestDateibefehle::beendenMitAenderungen()
{
    QFETCH(Antwort, antwort);
    QFETCH(bool, beendet);
    QFETCH(bool, geschrieben);
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QSignalSpy ende(f.get(), &FormMinis::ProgrammEnde);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("ende.prd");
    f->Daten().Geaendert = true;
    t.meldungen.antworte(antwort);
    QVERIFY(Waehle(*f, "MnuProgrammBeenden"));

    QCOMPARE(t.meldungen.texte(), QStringList{Frage.arg(t.pfad("ende.prd").toUpper())});
    QCOMPARE(t.meldungen.gezeigt().front().knoepfe, Knoepfe::JaNeinAbbrechen);
    QCOMPARE(ende.count(), beendet ? 1 : 0);
    QCOMPARE(f->isVisible(), !beendet);
    QCOMPARE(QFile::exists(t.pfad("ende.prd")), geschrieben);
    if (antwort == Antwort::Abbrechen)
        QVERIFY(f->Daten().Geaendert);
}

void TestDateibefehle::beendenJaMitFehlschlagBleibtOffen()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QSignalSpy ende(f.get(), &FormMinis::ProgrammEnde);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("fehlt/ende.prd");
    f->Daten().Geaendert = true;
    t.meldungen.antworte(Antwort::Ja);
    QVERIFY(Waehle(*f, "MnuProgrammBeenden"));
    QCOMPARE(t.meldungen.titel(), (QStringList{"Programm beenden", "Fehler beim Sichern"}));
    QCOMPARE(ende.count(), 0);
    QVERIFY(f->isVisible());
    QVERIFY(f->Daten().Geaendert);
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Dis"));
}

void TestDateibefehle::schliessfeldWieProgrammBeenden()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QSignalSpy ende(f.get(), &FormMinis::ProgrammEnde);
    t.meldungen.antworte(Antwort::Nein);
    QVERIFY(!f->close());
    QCOMPARE(t.meldungen.texte(), QStringList{"Soll das Programm beendet werden?"});
    QVERIFY(f->isVisible());

    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("box.prd");
    f->Daten().Geaendert = true;
    t.meldungen.antworte(Antwort::Abbrechen);
    QVERIFY(!f->close());
    QVERIFY(f->isVisible());
    QVERIFY(!QFile::exists(t.pfad("box.prd")));

    t.meldungen.antworte(Antwort::Ja);
    QVERIFY(f->close());
    QVERIFY(QFile::exists(t.pfad("box.prd")));
    QCOMPARE(ende.count(), 1);
    QCOMPARE(t.meldungen.titel(), QStringList(3, "Programm beenden"));
}

void TestDateibefehle::schliessfeldWaehrendSekundaerfensterWirkungslos()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuEinstellungen"));
    QVERIFY(!f->close());
    QVERIFY(t.meldungen.gezeigt().empty());
    QVERIFY(f->isVisible());
}

QTEST_MAIN(TestDateibefehle)
#include "tst_dateibefehle.moc"
