#pragma once

#include "data/InitMini.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"
#include "support/TestZufall.h"
#include "ui/Hilfe.h"
#include "ui/Umgebung.h"

#include <QApplication>
#include <QStringList>
#include <QTemporaryDir>
#include <QWidget>

#include <memory>

class FormMinis;
class QAction;

// Counts the help calls instead of opening a viewer.
class TestHilfe : public Hilfe
{
public:
    void setzeDatei(const QString &pfad) override { m_datei = pfad; }
    QString datei() const override { return m_datei; }
    void ZeigeInhalt() override { ++inhalt; }
    void ZeigeHilfeZurHilfe() override { ++hilfeZurHilfe; }

    int inhalt = 0;
    int hilfeZurHilfe = 0;

private:
    QString m_datei;
};

// Scripted message boxes, a fixed clock, an exact random source, a counting help viewer and a
// temporary folder that stands for the program's folder.
struct Testumgebung {
    Testumgebung();

    TestMeldungen meldungen;
    TestUhr uhr;
    TestZufall zufall;
    TestHilfe hilfe;
    QTemporaryDir ordner;

    Umgebung umgebung() { return Umgebung{meldungen, uhr, zufall, hilfe, ordner.path()}; }
    QString pfad(const QString &name) const { return ordner.filePath(name); }
};

// A fresh, shown and active main window.
std::unique_ptr<FormMinis> NeuesHauptfenster(Testumgebung &t);

// A data set with the given servers (family names) and, if plaene > 0, that many plan entries.
InitMini Beispieldaten(const QStringList &namen, int plaene = 0);

// Writes daten as a data file; fails the test if it cannot.
void SchreibeBeispiel(const QString &pfad, const InitMini &daten);

// Top-level widgets of the program: the visible secondary window of that type, or null.
template <typename T>
T *OffenesFenster()
{
    for (QWidget *w : QApplication::topLevelWidgets()) {
        if (auto *t = qobject_cast<T *>(w); t && t->isVisible())
            return t;
    }
    return nullptr;
}

// Deletes what was closed with deleteLater (secondary windows are deleted on close).
void Aufraeumen();

QAction *Aktion(FormMinis &f, const QString &name);
// Enabled as the user sees it: the item and its top-level menu.
bool Erreichbar(FormMinis &f, const QString &aktion);
bool MenueAn(FormMinis &f, const QString &menue);
// Which of the Up / Down / Dis images of a toolbar button is visible ("Up", "Down", "Dis"), or
// a list of them when it is not exactly one.
QString SichtbaresBild(FormMinis &f, const QString &knopf);
// Triggers a menu item only when the user could reach it.
bool Waehle(FormMinis &f, const QString &aktion);

QStringList Dateizeilen(const QString &pfad);
