// The settings dialog: showing the settings, the spin arrows, the correction when the text box
// is left, OK and Abbrechen, and how the main window opens it.
#include "support_umgebung.h"

#include "ui/FormEinstellungen.h"
#include "ui/FormMinis.h"

#include <QCheckBox>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>
#include <QToolButton>

namespace {

const QString Warnung = QStringLiteral("Den Abstand zwischen zwei Einteilungen >10 oder <0 zu wählen, macht keinen "
                                       "Sinn. Korrigiere auf Default-Wert 2.");

struct Dialog {
    Testumgebung t;
    std::unique_ptr<FormMinis> haupt = NeuesHauptfenster(t);
    FormEinstellungen *fenster = nullptr;

    Dialog()
    {
        haupt->Einstellungen();
        fenster = OffenesFenster<FormEinstellungen>();
        QApplication::setActiveWindow(fenster);
    }
    InitMini &d() { return haupt->Daten(); }
    QLineEdit *text() { return fenster->findChild<QLineEdit *>("TxtIntervall"); }
    QCheckBox *geschwister() { return fenster->findChild<QCheckBox *>("CheckGeschwister"); }
    void klicke(const char *name) { QTest::mouseClick(fenster->findChild<QAbstractButton *>(name), Qt::LeftButton); }
    // Types into the text box as the user does: focus in, replace the text.
    void tippe(const QString &eingabe)
    {
        text()->setFocus(Qt::TabFocusReason);
        text()->selectAll();
        QTest::keyClick(text(), Qt::Key_Delete);
        QTest::keyClicks(text(), eingabe);
    }
};

} // namespace

class TestFormEinstellungen : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { Aufraeumen(); }

    void zeigtDieEinstellungen();
    void okUebernimmtUndMarkiertGeaendert();
    void werteAusserhalbWerdenZu2_data();
    void werteAusserhalbWerdenZu2();
    void randwerteOhneMeldung_data();
    void randwerteOhneMeldung();
    void verlassenDesTextfeldsKorrigiert();
    void pfeileBleibenInnerhalb();
    void abbrechenLaesstAllesUnveraendert();
    void schliessenStelltHauptfensterHer();
};

void TestFormEinstellungen::zeigtDieEinstellungen()
{
    {
        Dialog dlg;
        QCOMPARE(dlg.fenster->windowTitle(), QString("Einstellungen"));
        QVERIFY(dlg.geschwister()->isChecked());
        QCOMPARE(dlg.text()->text(), QString("2"));
        QCOMPARE(dlg.fenster->focusWidget(), dlg.fenster->findChild<QWidget *>("BtnAbbruchEinstellungen"));
        QCOMPARE(dlg.geschwister()->text(), QString("Geschwister zusammen einteilen"));
        QCOMPARE(dlg.fenster->findChild<QPushButton *>("BtnOKEinstellungen")->text(), QString("OK"));
        QCOMPARE(dlg.fenster->findChild<QPushButton *>("BtnAbbruchEinstellungen")->text(), QString("Abbrechen"));
        dlg.fenster->close();
    }
    Testumgebung t;
    auto haupt = NeuesHauptfenster(t);
    haupt->Daten().Geschwister = false;
    haupt->Daten().Intervall = 7;
    haupt->Einstellungen();
    auto *fenster = OffenesFenster<FormEinstellungen>();
    QVERIFY(!fenster->findChild<QCheckBox *>("CheckGeschwister")->isChecked());
    QCOMPARE(fenster->findChild<QLineEdit *>("TxtIntervall")->text(), QString("7"));
    fenster->close();
}

void TestFormEinstellungen::okUebernimmtUndMarkiertGeaendert()
{
    Dialog dlg;
    QVERIFY(!dlg.d().Geaendert);
    dlg.klicke("BtnOKEinstellungen");
    // OK without a change still marks the data as changed.
    QVERIFY(dlg.d().Geaendert);
    QCOMPARE(dlg.d().Intervall, int16_t(2));
    QVERIFY(dlg.d().Geschwister);

    Dialog neu;
    neu.tippe("5");
    neu.klicke("CheckGeschwister");
    neu.klicke("BtnOKEinstellungen");
    QVERIFY(neu.t.meldungen.gezeigt().empty());
    QCOMPARE(neu.d().Intervall, int16_t(5));
    QVERIFY(!neu.d().Geschwister);
    QVERIFY(!neu.fenster->isVisible());
}

void TestFormEinstellungen::werteAusserhalbWerdenZu2_data()
{
    QTest::addColumn<QString>("eingabe");
    QTest::newRow("11") << "11";
    QTest::newRow("-1") << "-1";
    QTest::newRow("10.6 rounds to 11") << "10.6";
    QTest::newRow("beyond 16 bits") << "99999";
    QTest::newRow("far below") << "-40000";
    QTest::newRow("huge exponent") << "1E300";
}

void TestFormEinstellungen::werteAusserhalbWerdenZu2()
{
    QFETCH(QString, eingabe);
    Dialog dlg;
    dlg.d().Intervall = 4;
    dlg.tippe(eingabe);
    dlg.klicke("BtnOKEinstellungen");
    QCOMPARE(dlg.t.meldungen.texte(), QStringList{Warnung});
    QCOMPARE(dlg.t.meldungen.titel(), QStringList{"Intervall zu groß"});
    QCOMPARE(dlg.t.meldungen.gezeigt().front().symbol, Symbol::Information);
    QCOMPARE(dlg.t.meldungen.gezeigt().front().knoepfe, Knoepfe::OK);
    QCOMPARE(dlg.d().Intervall, int16_t(2));
}

void TestFormEinstellungen::randwerteOhneMeldung_data()
{
    QTest::addColumn<QString>("eingabe");
    QTest::addColumn<int>("wert");
    QTest::newRow("10") << "10" << 10;
    QTest::newRow("0") << "0" << 0;
    QTest::newRow("3.7 rounds") << "3.7" << 4;
    QTest::newRow("2.5 to even") << "2.5" << 2;
    QTest::newRow("no number") << "abc" << 0;
    QTest::newRow("leading number") << "6 Gottesdienste" << 6;
}

void TestFormEinstellungen::randwerteOhneMeldung()
{
    QFETCH(QString, eingabe);
    QFETCH(int, wert);
    Dialog dlg;
    dlg.tippe(eingabe);
    dlg.klicke("BtnOKEinstellungen");
    QVERIFY(dlg.t.meldungen.gezeigt().empty());
    QCOMPARE(int(dlg.d().Intervall), wert);
}

void TestFormEinstellungen::verlassenDesTextfeldsKorrigiert()
{
    Dialog dlg;
    dlg.tippe("12");
    QTest::keyClick(dlg.text(), Qt::Key_Tab);
    QCOMPARE(dlg.t.meldungen.titel(), QStringList{"Intervall zu groß"});
    QCOMPARE(dlg.text()->text(), QString("2"));
    // Already corrected: OK shows nothing more.
    dlg.klicke("BtnOKEinstellungen");
    QCOMPARE(dlg.t.meldungen.gezeigt().size(), size_t(1));

    Dialog zweiter;
    zweiter.tippe("3.7");
    QTest::keyClick(zweiter.text(), Qt::Key_Tab);
    QCOMPARE(zweiter.text()->text(), QString("4"));
    zweiter.tippe("");
    QTest::keyClick(zweiter.text(), Qt::Key_Tab);
    QCOMPARE(zweiter.text()->text(), QString("0"));
    QVERIFY(zweiter.t.meldungen.gezeigt().empty());
    zweiter.fenster->close();
}

void TestFormEinstellungen::pfeileBleibenInnerhalb()
{
    Dialog dlg;
    dlg.klicke("SpinBtnIntervallHoch");
    QCOMPARE(dlg.text()->text(), QString("3"));
    dlg.klicke("SpinBtnIntervallRunter");
    dlg.klicke("SpinBtnIntervallRunter");
    QCOMPARE(dlg.text()->text(), QString("1"));
    dlg.text()->setText("10");
    dlg.klicke("SpinBtnIntervallHoch");
    QCOMPARE(dlg.text()->text(), QString("10"));
    dlg.text()->setText("0");
    dlg.klicke("SpinBtnIntervallRunter");
    QCOMPARE(dlg.text()->text(), QString("0"));
    // A typed value outside moves only back towards the range.
    dlg.text()->setText("15");
    dlg.klicke("SpinBtnIntervallHoch");
    QCOMPARE(dlg.text()->text(), QString("15"));
    dlg.klicke("SpinBtnIntervallRunter");
    QCOMPARE(dlg.text()->text(), QString("14"));
    QVERIFY(dlg.t.meldungen.gezeigt().empty());
    dlg.fenster->close();
}

void TestFormEinstellungen::abbrechenLaesstAllesUnveraendert()
{
    Dialog dlg;
    dlg.tippe("11");
    dlg.klicke("CheckGeschwister");
    dlg.klicke("BtnAbbruchEinstellungen");
    // Leaving the text box comes first, so the message is still shown.
    QCOMPARE(dlg.t.meldungen.titel(), QStringList{"Intervall zu groß"});
    QCOMPARE(dlg.d().Intervall, int16_t(2));
    QVERIFY(dlg.d().Geschwister);
    QVERIFY(!dlg.d().Geaendert);
    QVERIFY(!dlg.fenster->isVisible());

    Dialog escape;
    escape.tippe("7");
    QTest::keyClick(escape.text(), Qt::Key_Escape);
    QVERIFY(!escape.fenster->isVisible());
    QVERIFY(escape.t.meldungen.gezeigt().empty());
    QCOMPARE(escape.d().Intervall, int16_t(2));
}

void TestFormEinstellungen::schliessenStelltHauptfensterHer()
{
    Dialog dlg;
    QVERIFY(!dlg.haupt->isEnabled());
    QVERIFY(dlg.fenster->isEnabled());
    QCOMPARE(SichtbaresBild(*dlg.haupt, "Search"), QString("Down"));
    dlg.klicke("BtnOKEinstellungen");
    QVERIFY(dlg.haupt->isEnabled());
    QCOMPARE(SichtbaresBild(*dlg.haupt, "Search"), QString("Up"));
}

QTEST_MAIN(TestFormEinstellungen)
#include "tst_formeinstellungen.moc"
