#pragma once

#include "data/InitMini.h"

#include <QGroupBox>

#include <cstdint>
#include <vector>

class Meldungen;
class Hauptfenster;
class QLineEdit;
class QPushButton;

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

    // The designed size, so the page keeps its arrangement wherever there is room for it.
    QSize sizeHint() const override;

    // The page's procedures and its working copy, public so tests can follow what a click did.
    void AktiviereTerminListe();
    void DeaktiviereTerminListe();
    void AnzeigeTerminDaten();
    void LadeTerminDaten();
    void SortiereTermin(int L, int R);

    std::vector<AusnahmeSeite> Seiten = std::vector<AusnahmeSeite>(1);
    int16_t AnzahlSeiten = 0;
    int16_t AktuelleSeite = 0;
    const AusnahmeSeite LeereSeite{};

private:
    void BtnOK2_Click();
    void BtnAbbruch2_Click();
    void BtnHinzufuegen2_Click();
    void BtnLoeschen2_Click();
    void BtnAlleLoeschen_Click();
    void BtnLeft2_Click();
    void BtnRight2_Click();

    void baueSeite();
    void entferneSeite();
    QList<QWidget *> seitenSteuerelemente() const;

    InitMini &m_daten;
    Meldungen &m_meldungen;
    Hauptfenster &m_hauptfenster;

    // [slot 0..3][weekday 1..7]: TxtZeit1(d) .. TxtZeit4(d), TxtMiniAnz1(d) .. TxtMiniAnz4(d).
    QLineEdit *m_txtZeit[4][8] = {};
    QLineEdit *m_txtMiniAnz[4][8] = {};
    QLineEdit *m_txtDatum = nullptr;
    QLineEdit *m_txtZeitT[4] = {};
    QLineEdit *m_txtMiniAnzT[4] = {};
    QPushButton *m_btnLeft2 = nullptr;
    QPushButton *m_btnRight2 = nullptr;
    QPushButton *m_btnHinzufuegen2 = nullptr;
    QPushButton *m_btnLoeschen2 = nullptr;
    QPushButton *m_btnAlleLoeschen = nullptr;
    QPushButton *m_btnOK2 = nullptr;
    QPushButton *m_btnAbbruch2 = nullptr;
};
