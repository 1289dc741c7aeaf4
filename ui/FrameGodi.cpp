#include "ui/FrameGodi.h"

#include "data/Datum.h"
#include "data/Meldungen.h"
#include "data/Werte.h"
#include "ui/Cp1252Eingabe.h"
#include "ui/Hauptfenster.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStyle>
#include <QVBoxLayout>

#include <algorithm>
#include <cstdint>
#include <utility>

namespace {

const QString TitelFehler = QStringLiteral("Fehler in Anwendung");
constexpr double MaxMinisJeDienst = 40;

} // namespace

FrameGodi::FrameGodi(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent)
    : QGroupBox(parent), m_daten(daten), m_meldungen(meldungen), m_hauptfenster(hauptfenster)
{
    setObjectName(QStringLiteral("FrameGodi"));
    setTitle(QStringLiteral("Gottesdienste"));
    baueSeite();
    hide();
}

void FrameGodi::baueSeite()
{
    auto feld = [](QWidget *eltern, const QString &name) {
        auto *f = new QLineEdit(eltern);
        f->setObjectName(name);
        NurCp1252(f);
        return f;
    };
    auto anzahlFeld = [&feld](QWidget *eltern, const QString &name) {
        QLineEdit *f = feld(eltern, name);
        f->setFixedWidth(f->fontMetrics().horizontalAdvance(QStringLiteral("000")) + 12);
        return f;
    };
    auto beschriftung = [](QWidget *eltern, const char *name, const QString &text) {
        auto *l = new QLabel(text, eltern);
        l->setObjectName(QString::fromUtf8(name));
        return l;
    };
    auto knopf = [](QWidget *eltern, const char *name, const QString &text) {
        auto *k = new QPushButton(text, eltern);
        k->setObjectName(QString::fromUtf8(name));
        return k;
    };
    auto zeile = [](QLineEdit *zeit, QLineEdit *anzahl) {
        auto *z = new QHBoxLayout;
        z->setSpacing(2);
        z->addWidget(zeit, 1);
        z->addWidget(anzahl);
        return z;
    };

    auto *panelRegulaer = new QGroupBox(QStringLiteral("reguläre Gottesdienste"), this);
    panelRegulaer->setObjectName(QStringLiteral("PanelRegulär"));
    auto *raster = new QGridLayout(panelRegulaer);
    raster->setVerticalSpacing(6);
    raster->setHorizontalSpacing(10);
    // Montag .. Donnerstag above, Freitag, Samstag, Sonntag below: weekday index, label.
    const std::pair<int, const char *> bloecke[] = {{2, "Label3"}, {3, "Label4"}, {4, "Label5"}, {5, "Label6"},
                                                    {6, "Label7"}, {7, "Label8"}, {1, "Label9"}};
    int block = 0;
    for (const auto &[d, label] : bloecke) {
        auto *spalte = new QVBoxLayout;
        spalte->setSpacing(2);
        spalte->addWidget(beschriftung(panelRegulaer, label, m_daten.Wochentag[d]));
        for (int k = 0; k < 4; ++k) {
            const QString nummer = QStringLiteral("%1(%2)").arg(k + 1).arg(d);
            m_txtZeit[k][d] = feld(panelRegulaer, QStringLiteral("TxtZeit") + nummer);
            m_txtMiniAnz[k][d] = anzahlFeld(panelRegulaer, QStringLiteral("TxtMiniAnz") + nummer);
            spalte->addLayout(zeile(m_txtZeit[k][d], m_txtMiniAnz[k][d]));
        }
        raster->addLayout(spalte, block / 4, block % 4);
        ++block;
    }
    raster->addWidget(beschriftung(panelRegulaer, "Label10", QStringLiteral("Links: Uhrzeit, Rechts: Anzahl der Minis")),
                      2, 0, 1, 4);
    raster->setRowStretch(3, 1);

    auto *panelAusnahmen = new QGroupBox(QStringLiteral("Ausnahmen/Feiertage"), this);
    panelAusnahmen->setObjectName(QStringLiteral("PanelAusnahmen"));
    auto *seite = new QVBoxLayout(panelAusnahmen);
    seite->setSpacing(3);
    seite->addWidget(beschriftung(panelAusnahmen, "Label11", QStringLiteral("Datum")));
    m_txtDatum = feld(panelAusnahmen, QStringLiteral("TxtDatum"));
    seite->addWidget(m_txtDatum);
    seite->addWidget(beschriftung(panelAusnahmen, "Label12", QStringLiteral("Uhrzeit, Anzahl Minis")));
    for (int k = 0; k < 4; ++k) {
        m_txtZeitT[k] = feld(panelAusnahmen, QStringLiteral("TxtZeitT%1").arg(k + 1));
        m_txtMiniAnzT[k] = anzahlFeld(panelAusnahmen, QStringLiteral("TxtMiniAnzT%1").arg(k + 1));
        seite->addLayout(zeile(m_txtZeitT[k], m_txtMiniAnzT[k]));
    }
    auto pfeil = [panelAusnahmen](const char *name, QStyle::StandardPixmap bild, const QString &bedeutung) {
        auto *k = new QPushButton(panelAusnahmen);
        k->setObjectName(QString::fromUtf8(name));
        k->setIcon(panelAusnahmen->style()->standardIcon(bild));
        k->setIconSize(QSize(24, 24));
        k->setFixedSize(49, 33);
        k->setAccessibleName(bedeutung);
        return k;
    };
    m_btnLeft2 = pfeil("BtnLeft2", QStyle::SP_ArrowLeft, QStringLiteral("Vorige Seite"));
    m_btnRight2 = pfeil("BtnRight2", QStyle::SP_ArrowRight, QStringLiteral("Nächste Seite"));
    auto *pfeile = new QHBoxLayout;
    pfeile->addStretch(1);
    pfeile->addWidget(m_btnLeft2);
    pfeile->addWidget(m_btnRight2);
    pfeile->addStretch(1);
    seite->addSpacing(4);
    seite->addLayout(pfeile);
    seite->addSpacing(4);
    m_btnHinzufuegen2 = knopf(panelAusnahmen, "BtnHinzufügen2", QStringLiteral("Hinzufügen"));
    m_btnLoeschen2 = knopf(panelAusnahmen, "BtnLöschen2", QStringLiteral("Löschen"));
    m_btnAlleLoeschen = knopf(panelAusnahmen, "BtnAlleLöschen", QStringLiteral("Alle Seiten löschen"));
    seite->addWidget(m_btnHinzufuegen2);
    seite->addWidget(m_btnLoeschen2);
    seite->addWidget(m_btnAlleLoeschen);
    seite->addStretch(1);

    m_btnOK2 = knopf(this, "BtnOK2", QStringLiteral("OK"));
    m_btnAbbruch2 = knopf(this, "BtnAbbruch2", QStringLiteral("Abbrechen"));
    auto *knoepfe = new QHBoxLayout;
    knoepfe->addWidget(m_btnOK2);
    knoepfe->addWidget(m_btnAbbruch2);
    knoepfe->addStretch(1);
    auto *links = new QVBoxLayout;
    links->addWidget(panelRegulaer, 1);
    links->addLayout(knoepfe);
    auto *haupt = new QHBoxLayout(this);
    haupt->addLayout(links, 3);
    haupt->addWidget(panelAusnahmen, 1);

    connect(m_btnOK2, &QPushButton::clicked, this, &FrameGodi::BtnOK2_Click);
    connect(m_btnAbbruch2, &QPushButton::clicked, this, &FrameGodi::BtnAbbruch2_Click);
    connect(m_btnHinzufuegen2, &QPushButton::clicked, this, &FrameGodi::BtnHinzufuegen2_Click);
    connect(m_btnLoeschen2, &QPushButton::clicked, this, &FrameGodi::BtnLoeschen2_Click);
    connect(m_btnAlleLoeschen, &QPushButton::clicked, this, &FrameGodi::BtnAlleLoeschen_Click);
    connect(m_btnLeft2, &QPushButton::clicked, this, &FrameGodi::BtnLeft2_Click);
    connect(m_btnRight2, &QPushButton::clicked, this, &FrameGodi::BtnRight2_Click);
}

void FrameGodi::MnuTermine_Click()
{
    const InitMini &d = m_daten;
    m_hauptfenster.MenueDeaktivieren();
    show();
    AktiviereTerminListe();
    for (int tag = 1; tag <= 7; ++tag) {
        for (int k = 0; k < 4; ++k) {
            m_txtZeit[k][tag]->setText(d.Regulaer[tag].Zeit[k]);
            m_txtMiniAnz[k][tag]->setText(d.Regulaer[tag].MiniAnz[k]);
        }
    }
    AktuelleSeite = 0;
    const int anzahl = std::max<int>(d.AnzahlAusnahmen, 0);
    Seiten.assign(size_t(anzahl) + 1, LeereSeite);
    for (int i = 0; i < anzahl; ++i)
        Seiten[i] = d.Ausnahmen[i];
    AnzahlSeiten = int16_t(anzahl);
    // Without pages the page controls are cleared, so a first page added starts empty.
    AnzeigeTerminDaten();
    if (AnzahlSeiten == 0)
        DeaktiviereTerminListe();
}

void FrameGodi::DatenGeladen()
{
    Seiten.assign(size_t(std::max<int>(m_daten.AnzahlAusnahmen, 0)) + 1, LeereSeite);
}

QList<QWidget *> FrameGodi::seitenSteuerelemente() const
{
    QList<QWidget *> liste{m_btnLoeschen2, m_btnAlleLoeschen, m_btnLeft2, m_btnRight2, m_txtDatum};
    for (QLineEdit *f : m_txtZeitT)
        liste << f;
    for (QLineEdit *f : m_txtMiniAnzT)
        liste << f;
    return liste;
}

void FrameGodi::AktiviereTerminListe()
{
    for (QWidget *w : seitenSteuerelemente())
        w->setEnabled(true);
    m_txtDatum->setFocus();
}

void FrameGodi::DeaktiviereTerminListe()
{
    for (QWidget *w : seitenSteuerelemente())
        w->setEnabled(false);
    m_btnHinzufuegen2->setFocus();
}

void FrameGodi::AnzeigeTerminDaten()
{
    const AusnahmeSeite &s = Seiten[AktuelleSeite];
    m_txtDatum->setText(s.Datum);
    for (int k = 0; k < 4; ++k) {
        m_txtZeitT[k]->setText(s.Zeit[k]);
        m_txtMiniAnzT[k]->setText(s.MiniAnz[k]);
    }
}

void FrameGodi::LadeTerminDaten()
{
    AusnahmeSeite &s = Seiten[AktuelleSeite];
    const QString datum = m_txtDatum->text();
    if (!datum.isEmpty()) {
        const auto gelesen = LeseDatum(datum);
        if (!gelesen) {
            m_meldungen.zeige(QStringLiteral("Sie haben ungültige Werte unter Datum")
                                  + QStringLiteral(" eingegeben. Die Seite wurde") + QStringLiteral(" nicht übernommen."),
                              Knoepfe::OK, Symbol::Keins, TitelFehler);
            entferneSeite();
            return;
        }
        s.Datum = DatumText(*gelesen);
    }
    for (int k = 0; k < 4; ++k)
        s.Zeit[k] = m_txtZeitT[k]->text();
    for (QLineEdit *f : m_txtMiniAnzT) {
        if (ZahlWert(f->text()) > MaxMinisJeDienst) {
            m_meldungen.zeige(QStringLiteral("Sie haben die Maximalzahl von Ministranten ")
                                  + QStringLiteral("bei der Einteilung unter 'Ausnahmen/Feiertage' ")
                                  + QStringLiteral("überschritten. Diese beträgt ") + QStringLiteral(" 40")
                                  + QStringLiteral(". Die Werte wurden nicht übernommen! ")
                                  + QStringLiteral("Bitte überprüfen Sie Ihre zuletzt bearbeitete Seite ")
                                  + QStringLiteral("und korrigieren Sie auf einen kleineren Wert!"),
                              Knoepfe::OK, Symbol::Kritisch, TitelFehler);
            return;
        }
    }
    for (int k = 0; k < 4; ++k)
        s.MiniAnz[k] = m_txtMiniAnzT[k]->text();
}

// Removes page AktuelleSeite from the working copy and shows the page that takes its place.
void FrameGodi::entferneSeite()
{
    const int alt = AnzahlSeiten;
    if (alt < 1)
        return;
    --AnzahlSeiten;
    for (int i = AktuelleSeite; i < alt - 1; ++i)
        Seiten[i] = Seiten[i + 1];
    Seiten[alt - 1] = LeereSeite;
    Seiten.resize(size_t(AnzahlSeiten) + 1);
    if (AktuelleSeite > AnzahlSeiten - 1 && AnzahlSeiten > 0)
        AktuelleSeite = int16_t(AnzahlSeiten - 1);
    AnzeigeTerminDaten();
    if (AnzahlSeiten == 0)
        DeaktiviereTerminListe();
}

void FrameGodi::BtnHinzufuegen2_Click()
{
    // The count is a 16-bit value; there is no room for another page.
    if (AnzahlSeiten == INT16_MAX)
        return;
    ++AnzahlSeiten;
    Seiten.resize(size_t(AnzahlSeiten) + 1);
    if (AnzahlSeiten == 1)
        AktiviereTerminListe();
    LadeTerminDaten();
    AktuelleSeite = int16_t(AnzahlSeiten - 1);
    AnzeigeTerminDaten();
    m_txtDatum->setFocus();
}

void FrameGodi::BtnLeft2_Click()
{
    if (AktuelleSeite > 0) {
        LadeTerminDaten();
        AktuelleSeite = int16_t(std::max(AktuelleSeite - 1, 0));
        AnzeigeTerminDaten();
    }
    m_txtDatum->setFocus();
}

void FrameGodi::BtnRight2_Click()
{
    if (AnzahlSeiten > 0 && AktuelleSeite < AnzahlSeiten - 1) {
        LadeTerminDaten();
        AktuelleSeite = int16_t(std::min(AktuelleSeite + 1, AnzahlSeiten - 1));
        AnzeigeTerminDaten();
    }
    m_txtDatum->setFocus();
}

void FrameGodi::BtnLoeschen2_Click()
{
    if (m_meldungen.zeige(QStringLiteral("Soll Seite wirklich gelöscht werden?"), Knoepfe::JaNein, Symbol::Keins,
                          QStringLiteral("Löschen"))
        != Antwort::Ja)
        return;
    entferneSeite();
}

void FrameGodi::BtnAlleLoeschen_Click()
{
    if (m_meldungen.zeige(QStringLiteral("Sollen wirklich alle Seiten gelöscht werden?"), Knoepfe::JaNein,
                          Symbol::Keins, QStringLiteral("Löschen"))
        != Antwort::Ja)
        return;
    for (int i = 0; i < AnzahlSeiten; ++i)
        Seiten[i] = LeereSeite;
    AnzahlSeiten = 0;
    AktuelleSeite = 0;
    AnzeigeTerminDaten();
    DeaktiviereTerminListe();
}

void FrameGodi::BtnOK2_Click()
{
    InitMini &d = m_daten;
    for (int tag = 1; tag <= 7; ++tag) {
        for (int k = 0; k < 4; ++k) {
            if (ZahlWert(m_txtMiniAnz[k][tag]->text()) > MaxMinisJeDienst) {
                m_meldungen.zeige(QStringLiteral("Sie haben die Maximalzahl von Ministranten ")
                                      + QStringLiteral("bei der Einteilung unter 'reguläre Gottesdienste' ")
                                      + QStringLiteral("überschritten. Diese beträgt ") + QStringLiteral(" 40")
                                      + QStringLiteral(". Bitte korrigieren Sie auf einen kleineren Wert!"),
                                  Knoepfe::OK, Symbol::Kritisch, TitelFehler);
                return;
            }
        }
    }
    for (int tag = 1; tag <= 7; ++tag) {
        for (int k = 0; k < 4; ++k) {
            d.Regulaer[tag].Zeit[k] = m_txtZeit[k][tag]->text();
            d.Regulaer[tag].MiniAnz[k] = m_txtMiniAnz[k][tag]->text();
        }
    }
    if (AnzahlSeiten >= 1) {
        LadeTerminDaten();
        d.AnzahlAusnahmen = AnzahlSeiten;
        if (d.AnzahlAusnahmen >= 1) {
            d.Ausnahmen.resize(size_t(d.AnzahlAusnahmen) + 1);
            for (int i = 0; i < d.AnzahlAusnahmen; ++i)
                d.Ausnahmen[i] = Seiten[i];
            SortiereTermin(0, d.AnzahlAusnahmen - 1);
        }
    } else {
        d.AnzahlAusnahmen = 0;
    }
    hide();
    m_hauptfenster.MenueAktivieren();
    d.Geaendert = true;
}

void FrameGodi::BtnAbbruch2_Click()
{
    hide();
    m_hauptfenster.MenueAktivieren();
}

// Hoare quicksort by the date text compared by code value, so day of month comes first.
void FrameGodi::SortiereTermin(int L, int R)
{
    std::vector<AusnahmeSeite> &seiten = m_daten.Ausnahmen;
    int i = L;
    int j = R;
    const QString pivot = seiten[(L + R) / 2].Datum;
    do {
        while (seiten[i].Datum < pivot)
            ++i;
        while (seiten[j].Datum > pivot)
            --j;
        if (i <= j) {
            if (i < j)
                std::swap(seiten[i], seiten[j]);
            ++i;
            --j;
        }
    } while (i <= j);
    if (L < j)
        SortiereTermin(L, j);
    if (i < R)
        SortiereTermin(i, R);
}

QSize FrameGodi::sizeHint() const
{
    return QGroupBox::sizeHint().expandedTo(QSize(613, 369));
}
