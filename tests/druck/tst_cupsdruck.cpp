// Prints through the real print dialog on the system's printer service: the queue named in
// PRADILON_CUPS_DRUCKER must be listed, and the job must reach it without a message. The
// script cups-test.sh sets up the service and checks what arrives.
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include "data/InitMini.h"
#include "output/qt/QtDrucker.h"
#include "ui/FormDrucken.h"

#include <QApplication>
#include <QComboBox>
#include <QPushButton>
#include <QTest>

class TestCupsDruck : public QObject
{
    Q_OBJECT

private slots:
    void druckdialogDrucktAufDieWarteschlange();
};

void TestCupsDruck::druckdialogDrucktAufDieWarteschlange()
{
    const QString warteschlange = qEnvironmentVariable("PRADILON_CUPS_DRUCKER");
    if (warteschlange.isEmpty())
        QSKIP("PRADILON_CUPS_DRUCKER is not set; run through cups-test.sh");

    InitMini d;
    d.AnzahlMinis = 2;
    d.Minis.resize(3);
    d.Minis[0].Name = QStringLiteral("Müller");
    d.Minis[0].Vorname = QStringLiteral("Jörg");
    d.Minis[0].Strasse = QStringLiteral("Hauptstraße 1");
    d.Minis[1].Name = QStringLiteral("Schmidt");
    d.Minis[1].Vorname = QStringLiteral("Anna");
    d.Minis[1].Oberministrant = true;
    d.AnzahlPlanEintraege = 1;
    d.Plan.resize(2);
    d.Plan[0].Datum = QStringLiteral("03.01.2027");
    d.Plan[0].Wochentag = QStringLiteral("Sonntag");
    d.Plan[0].Zeit = QStringLiteral("10:00");
    d.Plan[0].MiniAnz = 2;
    d.Plan[0].Vorname[0] = QStringLiteral("Jörg");
    d.Plan[0].Name[0] = QStringLiteral("Müller");
    d.Plan[0].Vorname[1] = QStringLiteral("Anna");
    d.Plan[0].Name[1] = QStringLiteral("Schmidt");

    TestMeldungen meldungen;
    TestUhr uhr;
    FormDrucken f(d, meldungen, uhr, std::make_unique<QtDrucker>());
    QVERIFY(f.FormLoad());
    f.show();
    QVERIFY(QTest::qWaitForWindowExposed(&f));

    auto *drucker = f.findChild<QComboBox *>(QStringLiteral("CmbDrucker"));
    QVERIFY(drucker);
    const int index = drucker->findText(warteschlange);
    QVERIFY2(index >= 0, qPrintable(QStringLiteral("not listed: ") + warteschlange));
    // Chosen as a user does, so that the printer becomes current and its fonts are listed.
    drucker->setFocus();
    QTest::keyClick(drucker, Qt::Key_Home);
    for (int i = 0; i < index; ++i)
        QTest::keyClick(drucker, Qt::Key_Down);
    QCOMPARE(drucker->currentText(), warteschlange);

    auto *schrift = f.findChild<QComboBox *>(QStringLiteral("CmbSchriftart"));
    const int dejavu = schrift->findText(QStringLiteral("DejaVu Sans"));
    if (dejavu >= 0)
        schrift->setCurrentIndex(dejavu);

    QTest::mouseClick(f.findChild<QPushButton *>(QStringLiteral("BtnOK")), Qt::LeftButton);
    QCOMPARE(meldungen.texte(), QStringList());
    QVERIFY(!f.isVisible());
}

QTEST_MAIN(TestCupsDruck)
#include "tst_cupsdruck.moc"
