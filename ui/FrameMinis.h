#pragma once

#include <QGroupBox>

struct InitMini;
class Meldungen;
class Hauptfenster;

// The roster page with its search ("Minis").
class FrameMinis : public QGroupBox
{
    Q_OBJECT
public:
    FrameMinis(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent = nullptr);

    // Menu "&Liste ...": copies the roster into the working copy and opens the page.
    void MnuListe_Click();
    // A data file was loaded: the working copy starts empty with the new size.
    void DatenGeladen();
};
