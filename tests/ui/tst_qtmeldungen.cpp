// The real message boxes: German button texts, icon, title, and the answer for each button.
#include "ui/QtMeldungen.h"

#include <QApplication>
#include <QMessageBox>
#include <QPushButton>
#include <QTest>
#include <QTimer>

namespace {

struct Gesehen {
    QStringList knoepfe;
    QString titel;
    QString text;
    QMessageBox::Icon symbol = QMessageBox::NoIcon;
};

// Once the box is up, reads it and presses the button with the given text (or Escape when the
// text is empty).
void DrueckeSpaeter(const QString &knopf, Gesehen &gesehen)
{
    QTimer::singleShot(0, [knopf, &gesehen] {
        auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
        if (!box)
            qFatal("no message box");
        for (QAbstractButton *b : box->buttons())
            gesehen.knoepfe << b->text();
        gesehen.titel = box->windowTitle();
        gesehen.text = box->text();
        gesehen.symbol = box->icon();
        if (knopf.isEmpty()) {
            QTest::keyClick(box, Qt::Key_Escape);
            return;
        }
        for (QAbstractButton *b : box->buttons()) {
            if (b->text() == knopf) {
                b->click();
                return;
            }
        }
        box->close();
    });
}

} // namespace

Q_DECLARE_METATYPE(Knoepfe)
Q_DECLARE_METATYPE(Symbol)
Q_DECLARE_METATYPE(Antwort)

class TestQtMeldungen : public QObject
{
    Q_OBJECT

private slots:
    void knoepfeUndAntworten_data();
    void knoepfeUndAntworten();
};

void TestQtMeldungen::knoepfeUndAntworten_data()
{
    QTest::addColumn<Knoepfe>("knoepfe");
    QTest::addColumn<Symbol>("symbol");
    QTest::addColumn<QString>("druecke");
    QTest::addColumn<QStringList>("beschriftungen");
    QTest::addColumn<QMessageBox::Icon>("qtSymbol");
    QTest::addColumn<Antwort>("antwort");
    const QStringList jnA{"Ja", "Nein", "Abbrechen"};
    QTest::newRow("OK") << Knoepfe::OK << Symbol::Kritisch << "OK" << QStringList{"OK"} << QMessageBox::Critical
                        << Antwort::OK;
    QTest::newRow("OK/Abbrechen: Abbrechen") << Knoepfe::OKAbbrechen << Symbol::Ausrufezeichen << "Abbrechen"
                                             << QStringList{"OK", "Abbrechen"} << QMessageBox::Warning
                                             << Antwort::Abbrechen;
    QTest::newRow("Ja/Nein/Abbrechen: Ja") << Knoepfe::JaNeinAbbrechen << Symbol::Keins << "Ja" << jnA
                                           << QMessageBox::NoIcon << Antwort::Ja;
    QTest::newRow("Ja/Nein/Abbrechen: Nein") << Knoepfe::JaNeinAbbrechen << Symbol::Keins << "Nein" << jnA
                                             << QMessageBox::NoIcon << Antwort::Nein;
    QTest::newRow("Ja/Nein/Abbrechen: Escape") << Knoepfe::JaNeinAbbrechen << Symbol::Keins << "" << jnA
                                               << QMessageBox::NoIcon << Antwort::Abbrechen;
    QTest::newRow("Ja/Nein: Nein") << Knoepfe::JaNein << Symbol::Information << "Nein"
                                   << QStringList{"Ja", "Nein"} << QMessageBox::Information << Antwort::Nein;
}

void TestQtMeldungen::knoepfeUndAntworten()
{
    QFETCH(Knoepfe, knoepfe);
    QFETCH(Symbol, symbol);
    QFETCH(QString, druecke);
    QFETCH(QStringList, beschriftungen);
    QFETCH(QMessageBox::Icon, qtSymbol);
    QFETCH(Antwort, antwort);

    QtMeldungen meldungen;
    Gesehen gesehen;
    DrueckeSpaeter(druecke, gesehen);
    const Antwort ist = meldungen.zeige("Soll das Programm beendet werden?", knoepfe, symbol, "Programm beenden");
    QCOMPARE(ist, antwort);
    QStringList knoepfeGesehen = gesehen.knoepfe;
    QStringList erwartet = beschriftungen;
    knoepfeGesehen.sort();
    erwartet.sort();
    QCOMPARE(knoepfeGesehen, erwartet);
    QCOMPARE(gesehen.titel, QString("Programm beenden"));
    QCOMPARE(gesehen.text, QString("Soll das Programm beendet werden?"));
    QCOMPARE(gesehen.symbol, qtSymbol);
}

QTEST_MAIN(TestQtMeldungen)
#include "tst_qtmeldungen.moc"
