#pragma once

#include "support_umgebung.h"
#include "ui/FormMinis.h"

// Shared by the page tests, with the Qt headers they all use.
#include <QAbstractButton>
#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QMenu>
#include <QTest>

#include <memory>

template <class T = QWidget>
T *kind(const QObject *eltern, const QString &name)
{
    T *w = eltern->findChild<T *>(name);
    return w ? w : (qFatal("missing child %s", qPrintable(name)), nullptr);
}

// Base of the page tests: a fresh main window for each test; the helpers act on the page in seite.
class Seitentest : public QObject
{
protected:
    std::unique_ptr<Testumgebung> t;
    std::unique_ptr<FormMinis> f;
    QWidget *seite = nullptr;

    // A fresh main window, after the one of the test before is gone.
    void starte(const QString &seitenname)
    {
        f.reset();
        Aufraeumen();
        t = std::make_unique<Testumgebung>();
        f = NeuesHauptfenster(*t);
        seite = kind(f.get(), seitenname);
    }
    InitMini &d() { return f->Daten(); }
    // The main window's menus are off while a page is open.
    bool menueAn() const { return kind<QMenu>(f.get(), QStringLiteral("MnuDatei"))->menuAction()->isEnabled(); }
    QString text(const QString &feld) const { return kind<QLineEdit>(seite, feld)->text(); }
    // Replaces the text of a line edit or combo box as a user does: select all, then type.
    void tipp(const QString &feld, const QString &text)
    {
        auto *liste = qobject_cast<QComboBox *>(kind(seite, feld));
        QLineEdit *zeile = liste ? liste->lineEdit() : kind<QLineEdit>(seite, feld);
        zeile->selectAll();
        if (text.isEmpty())
            QTest::keyClick(zeile, Qt::Key_Delete);
        // QTest::keyClicks takes ASCII only; other characters arrive as key events carrying their text.
        for (const QChar c : text) {
            const char16_t code = c.toUpper().unicode();
            QTest::sendKeyEvent(QTest::Click, zeile, code <= 0xFF ? Qt::Key(code) : Qt::Key_unknown, QString(c), {});
        }
    }
    void klick(const QString &knopf)
    {
        auto *k = kind<QAbstractButton>(seite, knopf);
        // A check box stretched by its layout reacts only on its box and caption.
        QTest::mouseClick(k, Qt::LeftButton, {}, qobject_cast<QCheckBox *>(k) ? QPoint(8, k->height() / 2) : QPoint());
    }
    // "title: text" of every message box shown.
    QStringList meldungen() const
    {
        QStringList l;
        for (const auto &m : t->meldungen.gezeigt())
            l << m.titel + QStringLiteral(": ") + m.text;
        return l;
    }
    // The named controls in the wrong state: those in aus enabled, those in an disabled.
    QStringList falschGeschaltet(const QStringList &aus, const QStringList &an) const
    {
        QStringList falsch;
        for (const QString &n : aus + an)
            if (kind(seite, n)->isEnabled() != an.contains(n))
                falsch << n;
        return falsch;
    }
};
