#pragma once

#include "data/DatenDatei.h"
#include "data/InitMini.h"
#include "plan/PlanGenerator.h"
#include "ui/Hauptfenster.h"
#include "ui/Umgebung.h"

#include <QMainWindow>

#include <functional>
#include <optional>

class FrameGodi;
class FrameMinis;
class FramePlan;
class QAction;
class QLabel;
class QMenu;
class QTimer;
class Werkzeugknopf;

// The main window: menu tree, toolbar, clock, the three editing frames and the file commands.
// It owns the shared data of the run.
class FormMinis : public QMainWindow, public Hauptfenster
{
    Q_OBJECT
public:
    enum class Knopf { Open, Save, Print, Search, New, Help };

    explicit FormMinis(const Umgebung &umgebung, QWidget *parent = nullptr);
    ~FormMinis() override;

    InitMini &Daten() { return m_daten; }

    void MenueAktivieren() override;
    void MenueDeaktivieren() override;

    // The data file procedures with their window parts: the pages' reset, the title, the menus,
    // the toolbar image while writing.
    bool Laden();
    SpeicherErgebnis Speichern(bool speichernUnter = false);

    void DateiOeffnen();
    void SpeichernUnter();
    void ZeigeDateibrowser(const QString &titel);
    void ProgrammBeenden();
    void Einstellungen();
    void AnzeigePlan();
    void Information();
    void HilfeOeffnen();
    void HilfeZurHilfe();
    void FormActivate();

    Werkzeugknopf &knopf(Knopf k) const;

    // Opens a secondary window: the main window is disabled and the button (if any) shows its
    // Down image until the window closes, whichever way; then the main window is activated
    // again (title, reset of the browser flags).
    void ZeigeSekundaer(QWidget *fenster, std::optional<Knopf> gedrueckt,
                        std::function<void()> beimSchliessen = {});

signals:
    // The user confirmed ending the program; main() quits the event loop on it.
    void ProgrammEnde();

protected:
    void closeEvent(QCloseEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    void baueMenues();
    void baueWerkzeugleiste(QWidget *leiste);
    QAction *eintrag(QMenu *menu, const QString &name, const QString &text, std::function<void()> aktion);
    QMenu *menue(const QString &name, const QString &text);
    void zeigeUhrzeit();
    bool BeendenBestaetigt();
    void Beenden();
    void Drucken();
    void AlsPdfSpeichern();
    void setzeMenueaktion(const QString &name, bool an);
    void setzeMenue(const QString &name, bool an);

    Umgebung m_umgebung;
    InitMini m_daten;
    PlanGenerator m_generator;

    QLabel *m_panelDatum = nullptr;
    QTimer *m_timerDatum = nullptr;
    Werkzeugknopf *m_knoepfe[6] = {};
    FrameMinis *m_frameMinis = nullptr;
    FrameGodi *m_frameGodi = nullptr;
    FramePlan *m_framePlan = nullptr;
    QObject *m_hilfeTaste = nullptr;
    bool m_beendet = false;
};
