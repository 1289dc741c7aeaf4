#include "support_seiten.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QCheckBox>
#include <QLabel>
#include <QPushButton>
#include <QStyle>
#include <QStyleOptionButton>
#include <QTest>

SeitenHauptfenster::SeitenHauptfenster()
{
    // The main window writes its own text in bold, and its pages inherit that font.
    QFont schrift = font();
    schrift.setBold(true);
    setFont(schrift);
    resize(640, 420);
}

void SeitenHauptfenster::nimmSeite(QWidget *seite)
{
    seite->setParent(this);
    seite->setGeometry(8, 40, 613, 369);
}

void tippe(QLineEdit *feld, const QString &text)
{
    feld->selectAll();
    if (text.isEmpty())
        QTest::keyClick(feld, Qt::Key_Delete);
    // QTest::keyClicks takes ASCII only; umlauts and the typographic characters of the
    // code page arrive as key events carrying their text.
    for (const QChar c : text) {
        const char16_t code = c.toUpper().unicode();
        const auto taste = code <= 0xFF ? Qt::Key(code) : Qt::Key_unknown;
        QTest::sendKeyEvent(QTest::Click, feld, taste, QString(c), Qt::NoModifier);
    }
}

void tippe(QComboBox *liste, const QString &text)
{
    tippe(liste->lineEdit(), text);
}

void drueckeEnter(QComboBox *liste)
{
    QTest::keyClick(liste->lineEdit(), Qt::Key_Return);
}

void waehleEintrag(QComboBox *liste, int index)
{
    liste->showPopup();
    QAbstractItemView *ansicht = liste->view();
    QTRY_VERIFY(ansicht->isVisible());
    const QRect feld = ansicht->visualRect(ansicht->model()->index(index, 0));
    QTest::mouseClick(ansicht->viewport(), Qt::LeftButton, {}, feld.center());
    QTRY_VERIFY(!ansicht->isVisible());
}

void klicke(QAbstractButton *knopf)
{
    // A check box stretched by its layout reacts only on its box and caption, not on the
    // empty space to their right.
    if (qobject_cast<QCheckBox *>(knopf))
        QTest::mouseClick(knopf, Qt::LeftButton, {}, QPoint(8, knopf->height() / 2));
    else
        QTest::mouseClick(knopf, Qt::LeftButton);
}

QStringList eintraege(const QComboBox *liste)
{
    QStringList l;
    for (int i = 0; i < liste->count(); ++i)
        l << liste->itemText(i);
    return l;
}

QStringList abgeschnitteneBeschriftungen(const QWidget *wurzel)
{
    QStringList zuKlein;
    for (const QLabel *l : wurzel->findChildren<QLabel *>()) {
        if (l->text().isEmpty() || !l->isVisibleTo(wurzel))
            continue;
        const bool passt = l->wordWrap() ? l->height() >= l->heightForWidth(l->width())
                                         : l->width() >= l->sizeHint().width();
        if (!passt)
            zuKlein << l->objectName();
    }
    for (const QAbstractButton *k : wurzel->findChildren<QAbstractButton *>()) {
        if (k->text().isEmpty() || !k->isVisibleTo(wurzel))
            continue;
        if (k->width() < k->sizeHint().width() || k->height() < k->fontMetrics().height())
            zuKlein << k->objectName();
    }
    return zuKlein;
}
