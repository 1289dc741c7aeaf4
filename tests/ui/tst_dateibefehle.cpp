// The file commands through the real file browser, and the browser's own cases.
#include "support_umgebung.h"

#include "ui/FormFileBrw.h"

#include <QComboBox>
#include <QListView>
#include <QSignalSpy>

namespace {

// Types a name into the browser and clicks OK; no name: Escape.
void BrowserOK(const QString &name, QWidget *browser = OffenesFenster<FormFileBrw>())
{
    browser->findChild<QLineEdit *>("TxtDatei")->setText(name);
    name.isEmpty() ? QTest::keyClick(browser, Qt::Key_Escape) : browser->findChild<QPushButton *>("CmdOK")->click();
}

QString Frage(const QString &pfad) { return "Sollen Änderungen in " + pfad.toUpper() + " gesichert werden?"; }

} // namespace

class TestDateibefehle : public QObject
{
    Q_OBJECT
private slots:
    void cleanup() { Aufraeumen(); }
    void oeffnen();
    void speichernUndSpeichernUnter();
    void beenden();
    void browserLaufwerkMusterUndNamen();
};

// The browser stays open after a failed save (the data stays too) and after a name it cannot use.
void TestDateibefehle::oeffnen()
{
    const QString frage = "Datei öffnen", ungueltig = "Ungültiger Dateiname", fremd = "Fehler beim Öffnen";
    // changed, answer, current file, name typed ("": Escape), titles of the messages, first server afterwards
    const QList<std::tuple<bool, Antwort, QString, QString, QString, QString>> faelle = {
        {false, Antwort::Ja, "alt.prd", "neu.prd", "", "Neu"},
        {true, Antwort::Ja, "alt.prd", "neu.prd", frage, "Neu"},
        {true, Antwort::Nein, "alt.prd", "neu.prd", frage, "Neu"},
        {true, Antwort::Ja, "fehlt/alt.prd", "neu.prd", frage + "|Fehler beim Sichern", "Alt"},
        {false, Antwort::Ja, "alt.prd", "N*.PRD", "", "Neu"},
        {false, Antwort::Ja, "alt.prd", "*.txt", ungueltig, "Alt"},
        {false, Antwort::Ja, "alt.prd", "./neu.prd", ungueltig, "Alt"},
        {true, Antwort::Nein, "alt.prd", "gibtsnicht.prd", frage + "|" + ungueltig, "Alt"},
        {true, Antwort::Nein, "alt.prd", "fremd.prd", frage + "|" + fremd, "Alt"},
        {true, Antwort::Ja, "alt.prd", "", "", "Alt"}};
    for (const auto &[geaendert, antwort, alt, name, titel, danach] : faelle) {
        Testumgebung t;
        SchreibeBeispiel(t.pfad("neu.prd"), Beispieldaten({"Neu"}));
        QFile keineDaten(t.pfad("fremd.prd"));
        QVERIFY(keineDaten.open(QIODevice::WriteOnly) && keineDaten.write("pradilon\r\n 0 \r\n") && keineDaten.flush());
        auto f = NeuesHauptfenster(t);
        f->Daten() = Beispieldaten({"Alt"});
        f->Daten().Dateiname = t.pfad(alt);
        f->Daten().Geaendert = geaendert;
        QVERIFY(Waehle(*f, "MnuLaden") && f->Daten().DateiLaden && !f->isEnabled());
        QVERIFY(SichtbaresBild(*f, "Open") == "Down" && OffenesFenster<FormFileBrw>()->windowTitle() == frage);
        t.meldungen.antworte(antwort);
        BrowserOK(name);

        const QMap<QString, QString> texte = {
            {frage, Frage(t.pfad(alt))},
            {ungueltig, "Datei befindet sich nicht in diesem Verzeichnis oder der Dateiname ist ungültig!"},
            {fremd, "Dies ist keine Pradilon-Datei! Die Datei konnte nicht geöffnet werden! "}};
        QCOMPARE(t.meldungen.titel().join('|'), titel);
        for (int i = 0; i < t.meldungen.titel().size(); ++i)
            QCOMPARE(t.meldungen.texte()[i], texte.value(t.meldungen.titel()[i], t.meldungen.texte()[i]));
        QCOMPARE(QFile::exists(t.pfad(alt)), titel == frage && antwort == Antwort::Ja);
        if (auto *browser = OffenesFenster<FormFileBrw>())
            QVERIFY(browser->close() && (titel.contains("Fehler beim Sichern") || titel.contains(ungueltig)));
        const bool geladen = danach == "Neu";
        QVERIFY(f->Daten().Minis[0].Name == danach && f->Daten().Geaendert == (geaendert && !geladen));
        QCOMPARE(f->Daten().Dateiname, geladen ? QDir::toNativeSeparators(t.pfad("neu.prd")) : t.pfad(alt));
        QCOMPARE(f->windowTitle(), "Ministrantenplan - " + f->Daten().Dateiname.toUpper());
        QVERIFY(!f->Daten().DateiLaden && f->isEnabled());
        QCOMPARE(Zustand(*f), geladen ? ZustandMitMinis : ZustandStart);
    }
}

// Speichern writes only changes; Speichern unter writes also without and titles the window anew.
void TestDateibefehle::speichernUndSpeichernUnter()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("jetzt.prd");
    f->MenueAktivieren();
    QVERIFY(Waehle(*f, "MnuSpeichern") && !QFile::exists(t.pfad("jetzt.prd")));
    f->Daten().Geaendert = true;
    QTest::mouseClick(f->findChild<QWidget *>("ImSaveUp"), Qt::LeftButton);
    InitMini gelesen;
    QVERIFY(LeseDatei(t.pfad("jetzt.prd"), gelesen) && gelesen.Minis[0].Name == "Abel" && !f->Daten().Geaendert);

    QVERIFY(Waehle(*f, "MnuSpeichernUnter") && f->Daten().DateiSpeichernUnter && SichtbaresBild(*f, "Save") == "Down");
    QCOMPARE(OffenesFenster<FormFileBrw>()->windowTitle(), QString("Datei speichern unter"));
    BrowserOK("kopie.prd");
    QVERIFY(LeseDatei(t.pfad("kopie.prd"), gelesen) && !f->Daten().Geaendert && !f->Daten().DateiSpeichernUnter);
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + QDir::toNativeSeparators(t.pfad("kopie.prd")).toUpper());
    QVERIFY(t.meldungen.gezeigt().empty() && Zustand(*f) == ZustandMitMinis);
}

// "Programm beenden" and the close box ask the same; a failed save on Ja keeps the program.
void TestDateibefehle::beenden()
{
    const QList<std::tuple<bool, Antwort, QString, bool>> faelle = {   // changed, answer, file, ends
        {false, Antwort::Ja, "ende.prd", true},  {false, Antwort::Nein, "ende.prd", false},
        {true, Antwort::Ja, "ende.prd", true},   {true, Antwort::Nein, "ende.prd", true},
        {true, Antwort::Abbrechen, "ende.prd", false}, {true, Antwort::Ja, "fehlt/ende.prd", false}};
    for (bool schliessfeld : {false, true}) {
        for (const auto &[geaendert, antwort, datei, beendet] : faelle) {
            Testumgebung t;
            auto f = NeuesHauptfenster(t);
            QSignalSpy ende(f.get(), &FormMinis::ProgrammEnde);
            f->Daten() = Beispieldaten({"Abel"});
            f->Daten().Dateiname = t.pfad(datei);
            f->Daten().Geaendert = geaendert;
            t.meldungen.antworte(antwort);
            QVERIFY(schliessfeld ? f->close() == beendet : Waehle(*f, "MnuProgrammBeenden"));
            const auto &m = t.meldungen.gezeigt();
            QCOMPARE(m.size(), size_t(datei.startsWith("fehlt") ? 2 : 1));
            QCOMPARE(m.front().text, geaendert ? Frage(t.pfad(datei)) : QString("Soll das Programm beendet werden?"));
            QVERIFY(m.front().titel == "Programm beenden");
            QVERIFY(m.front().knoepfe == (geaendert ? Knoepfe::JaNeinAbbrechen : Knoepfe::JaNein));
            QVERIFY(ende.count() == int(beendet) && f->isVisible() != beendet);
            QCOMPARE(QFile::exists(t.pfad(datei)), geaendert && antwort == Antwort::Ja && beendet);
            QCOMPARE(f->Daten().Geaendert, geaendert && !(antwort == Antwort::Ja && beendet));
        }
    }
}

// With stand-ins for loading and saving: "*.*" lists every file (also one without an extension, not a hidden one),
// a drive that does not answer, names that cannot be saved under, and a root folder.
void TestDateibefehle::browserLaufwerkMusterUndNamen()
{
    Testumgebung t;
    for (const char *name : {"a.prd", "B.PRD", "c.txt", "d", ".0.prd"})
        QVERIFY(QFile(t.pfad(name)).open(QIODevice::WriteOnly));
    InitMini d;
    d.DateiSpeichernUnter = true;
    QStringList gespeichert;
    const auto speichern = [&](bool) { return gespeichert << d.Dateiname, SpeicherErgebnis::Gespeichert; };
    const QString fehlt = t.pfad("laufwerk-x");
    FormFileBrw b(d, t.meldungen, {[] { return true; }, speichern}, t.ordner.path(), {"/", fehlt + "/"});
    b.show();
    auto *liste = b.findChild<QListView *>("FileList");
    const auto dateien = [liste] {
        QStringList namen;
        for (int i = 0; i < liste->model()->rowCount(liste->rootIndex()); ++i)
            namen << liste->model()->index(i, 0, liste->rootIndex()).data().toString();
        return namen.sort(), namen;
    };
    QTRY_COMPARE(dateien(), (QStringList{"B.PRD", "a.prd"}));
    QCOMPARE(FindeDatei(t.ordner.path(), "*.PRD").value_or(""), "a.prd");   // the first listed, never a hidden one
    b.findChild<QComboBox *>("CmbDateiFormat")->setCurrentIndex(1);
    QCOMPARE(b.findChild<QLineEdit *>("TxtDatei")->text(), QString("*.*"));
    QTRY_COMPARE(dateien(), (QStringList{"B.PRD", "a.prd", "c.txt", "d"}));

    auto *laufwerke = b.findChild<QComboBox *>("DriveList");
    laufwerke->setCurrentIndex(1);
    const QString name = QDir::toNativeSeparators(fehlt).toUpper();
    QCOMPARE(t.meldungen.titel(), QStringList{"Fehler bei Laufwerk " + name});
    QCOMPARE(t.meldungen.texte(), QStringList{"Laufwerk " + name + " antwortet nicht! Prüfen Sie, ob ein "
                                              "Datenträger eingelegt ist, oder ob das Laufwerk existiert."});
    QVERIFY(laufwerke->currentIndex() == 0 && b.pfad() == QDir::cleanPath(t.ordner.path()));

    // In the root folder the name gets no second separator.
    t.meldungen.leeren();
    b.oeffneOrdner("/");
    for (const char *name : {"*.prd", "  ", "..", "a/b.prd", "a\\b", "a?b", "a|b", "a\"b", "a<b", "a\tb", "wurzel.prd"})
        BrowserOK(name, &b);
    QCOMPARE(t.meldungen.titel(), QStringList(10, "Ungültiger Dateiname"));
    QCOMPARE(gespeichert, QStringList{QDir::toNativeSeparators("/wurzel.prd")});
}

QTEST_MAIN(TestDateibefehle)
#include "tst_dateibefehle.moc"
