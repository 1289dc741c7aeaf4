#pragma once

#include "data/InitMini.h"

#include <QGroupBox>

#include <cstdint>
#include <vector>

class Meldungen;
class Hauptfenster;
class QCheckBox;
class QComboBox;
class QLabel;
class QLineEdit;
class QPushButton;

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

    // The designed size, so the page keeps its arrangement wherever there is room for it.
    QSize sizeHint() const override;

    // The page's procedures and its working copy, public so tests can follow what a click did.
    void AnzeigeDaten();
    void LadeDaten();
    void AktiviereListe();
    void DeaktiviereListe();
    void Sortiere(int L, int R);

    std::vector<Mini> MinisKopie = std::vector<Mini>(1);
    int16_t AnzahlKopie = 0;
    int16_t AktMini = 0;
    const Mini LeerMini{};
    bool TerminGewaehlt = false;
    int16_t TerminIndex = 0;
    bool TerminAnzeige = false;

private:
    void BtnOK_Click();
    void BtnAbbruch_Click();
    void BtnHinzufuegen_Click();
    void BtnLoeschen_Click();
    void BtnAlleTermineLoeschen_Click();
    void BtnBegin_Click();
    void BtnLeft_Click();
    void BtnRight_Click();
    void BtnEnd_Click();
    void BtnSuchkriterien_Click();
    void BtnSuchen_Click();
    void CmbTermine_Click(int index);
    void CmbTermine_Change();
    void CmbTermine_Enter();

    bool eventFilter(QObject *objekt, QEvent *ereignis) override;
    void baueSeite();
    void setzeEditText(const QString &text);
    // The list controls that AktiviereListe, DeaktiviereListe and the search switch together.
    QList<QWidget *> listenSteuerelemente() const;
    QList<QWidget *> suchSperre() const;

    InitMini &m_daten;
    Meldungen &m_meldungen;
    Hauptfenster &m_hauptfenster;

    QLineEdit *m_txtName = nullptr;
    QLineEdit *m_txtVorname = nullptr;
    QLineEdit *m_txtStrasse = nullptr;
    QLineEdit *m_txtOrt = nullptr;
    QLineEdit *m_txtTelefon = nullptr;
    QLabel *m_labName = nullptr;
    QLabel *m_labVorname = nullptr;
    QLabel *m_labStrasse = nullptr;
    QLabel *m_labOrt = nullptr;
    QLabel *m_labTelefon = nullptr;
    QCheckBox *m_checkOmi = nullptr;
    QCheckBox *m_checkNicht = nullptr;
    // Index 1 = Sonntag .. 7 = Samstag, as Ausgenommen.
    QCheckBox *m_checkTag[8] = {};
    QComboBox *m_cmbTermine = nullptr;
    QPushButton *m_btnLoeschen = nullptr;
    QPushButton *m_btnOK = nullptr;
    QPushButton *m_btnHinzufuegen = nullptr;
    QPushButton *m_btnAbbruch = nullptr;
    QPushButton *m_btnAlleTermineLoeschen = nullptr;
    QPushButton *m_btnLeft = nullptr;
    QPushButton *m_btnRight = nullptr;
    QPushButton *m_btnBegin = nullptr;
    QPushButton *m_btnEnd = nullptr;
    QPushButton *m_btnSuchen = nullptr;
    QPushButton *m_btnSuchkriterien = nullptr;
};
