#pragma once

#include "support/TestMeldungen.h"
#include "support/TestUhr.h"
#include "support/TestZufall.h"
#include "ui/FormMinis.h"
#include "ui/Hilfe.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QLineEdit>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

// Counts the help calls instead of opening a viewer.
class TestHilfe : public Hilfe
{
public:
    void setzeDatei(const QString &pfad) override { m_datei = pfad; }
    QString datei() const override { return m_datei; }
    void ZeigeInhalt() override { ++inhalt; }
    void ZeigeHilfeZurHilfe() override { ++hilfeZurHilfe; }
    int inhalt = 0, hilfeZurHilfe = 0;

private:
    QString m_datei;
};

// Scripted seams and a temporary folder standing for the program's folder.
struct Testumgebung {
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
// Servers with these family names and, if plaene > 0, that many plan entries.
InitMini Beispieldaten(const QStringList &namen, int plaene = 0);
void SchreibeBeispiel(const QString &pfad, const InitMini &daten);

// The visible top-level window of that type, or null.
template <typename T>
T *OffenesFenster()
{
    for (QWidget *w : QApplication::topLevelWidgets())
        if (auto *t = qobject_cast<T *>(w); t && t->isVisible())
            return t;
    return nullptr;
}

// Deletes what was closed with deleteLater (secondary windows are deleted on close).
void Aufraeumen();

// The visible image of a toolbar button ("Up", "Down", "Dis"), joined with "+" when not exactly one.
QString SichtbaresBild(FormMinis &f, const QString &knopf);
// Triggers a menu item only when the user could reach it (the item and its menu enabled).
bool Waehle(FormMinis &f, const QString &aktion);
// The menu items the user cannot reach (without "Mnu") and the toolbar images: "Speichern ... | Up Dis ...".
QString Zustand(FormMinis &f);
// Zustand at start, while a page is edited, with servers, with servers and a plan.
inline const QString ZustandStart = QStringLiteral(
    "Speichern SpeichernUnter AdressenSpeichern PlanSpeichern Drucken PdfSpeichern PlanAnzeigen PlanErstellen | "
    "Up Dis Dis Up Dis Up");
inline const QString ZustandBearbeitung = QStringLiteral(
    "Laden Speichern SpeichernUnter AdressenSpeichern PlanSpeichern Drucken PdfSpeichern ProgrammBeenden Liste "
    "Termine PlanAnzeigen PlanErstellen Einstellungen | Dis Dis Dis Dis Dis Up");
inline const QString ZustandMitMinis = QStringLiteral("PlanAnzeigen | Up Up Up Up Dis Up");
inline const QString ZustandMitPlan = QStringLiteral("| Up Up Up Up Up Up");
