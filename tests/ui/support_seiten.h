#pragma once

#include "ui/Hauptfenster.h"

#include <QComboBox>
#include <QLineEdit>
#include <QStringList>
#include <QWidget>

class QAbstractButton;

// A stand-in for the main window: a plain window in the main window's bold font that holds one
// page below a toolbar-high strip and records the calls that switch the menus.
class SeitenHauptfenster : public QWidget, public Hauptfenster
{
public:
    SeitenHauptfenster();

    void MenueAktivieren() override { aufrufe << QStringLiteral("MenueAktivieren"); }
    void MenueDeaktivieren() override { aufrufe << QStringLiteral("MenueDeaktivieren"); }

    // Places the page where the main window puts its frames (613 x 369 pixels below the toolbar).
    void nimmSeite(QWidget *seite);

    QStringList aufrufe;
};

// The named child of the given type; ends the test program when it is missing, because every
// later step would only fail the same way.
template <class T>
T *kind(const QObject *eltern, const QString &name)
{
    T *w = eltern->findChild<T *>(name);
    if (!w)
        qFatal("missing child %s", qPrintable(name));
    return w;
}

// Replaces the text of a box as a user does: select everything, then type.
void tippe(QLineEdit *feld, const QString &text);
void tippe(QComboBox *liste, const QString &text);
void drueckeEnter(QComboBox *liste);
// Picks entry index from the opened list with the mouse.
void waehleEintrag(QComboBox *liste, int index);
void klicke(QAbstractButton *knopf);
QStringList eintraege(const QComboBox *liste);

// Captions of labels, buttons and check boxes below wurzel that their widget cuts off.
QStringList abgeschnitteneBeschriftungen(const QWidget *wurzel);
