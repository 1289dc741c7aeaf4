#pragma once

#include <QGroupBox>

struct InitMini;
class Meldungen;
class Hauptfenster;

// The services page ("Gottesdienste"): regular services and the exception/holiday pages.
class FrameGodi : public QGroupBox
{
    Q_OBJECT
public:
    FrameGodi(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent = nullptr);

    // Menu "&Termine ...": copies the services into the working copy and opens the page.
    void MnuTermine_Click();
    // A data file was loaded: the working copy of the pages starts empty with the new size.
    void DatenGeladen();
};
