#include "ui/FrameMinis.h"

#include "data/Datum.h"
#include "data/Meldungen.h"
#include "ui/Cp1252Eingabe.h"
#include "ui/Hauptfenster.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStyle>
#include <QVBoxLayout>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <optional>
#include <utility>

namespace {

const QString TitelFehler = QStringLiteral("Fehler in Anwendung");

// One excluded-dates entry in its stored form: a date, or two dates joined at the first "-"
// whose end does not lie before its start. Nothing when the entry is neither.
std::optional<QString> NormalisiereTermin(const QString &eintrag)
{
    const qsizetype strich = eintrag.indexOf(u'-');
    if (strich < 0) {
        const auto datum = LeseDatum(eintrag);
        if (!datum)
            return std::nullopt;
        return DatumText(*datum);
    }
    const auto anfang = LeseDatum(eintrag.left(strich));
    const auto ende = LeseDatum(eintrag.mid(strich + 1));
    if (!anfang || !ende || *ende < *anfang)
        return std::nullopt;
    return DatumText(*anfang) + u'-' + DatumText(*ende);
}

// Prefix match of the search: the first laenge characters of feld, in capitals, equal kriterium.
bool PasstAnfang(const QString &feld, const QString &kriterium, qsizetype laenge)
{
    return feld.left(laenge).toUpper() == kriterium;
}

} // namespace

FrameMinis::FrameMinis(InitMini &daten, Meldungen &meldungen, Hauptfenster &hauptfenster, QWidget *parent)
    : QGroupBox(parent), m_daten(daten), m_meldungen(meldungen), m_hauptfenster(hauptfenster)
{
    setObjectName(QStringLiteral("FrameMinis"));
    setTitle(QStringLiteral("Minis"));
    baueSeite();
    hide();
}

void FrameMinis::baueSeite()
{
    auto feld = [this](const char *name) {
        auto *f = new QLineEdit(this);
        f->setObjectName(QString::fromUtf8(name));
        NurCp1252(f);
        return f;
    };
    auto beschriftung = [this](const char *name, const QString &text) {
        auto *l = new QLabel(text, this);
        l->setObjectName(QString::fromUtf8(name));
        return l;
    };
    auto knopf = [this](const char *name, const QString &text) {
        auto *k = new QPushButton(text, this);
        k->setObjectName(QString::fromUtf8(name));
        return k;
    };
    auto haken = [this](const char *name, const QString &text) {
        auto *c = new QCheckBox(text, this);
        c->setObjectName(QString::fromUtf8(name));
        return c;
    };
    auto pfeil = [this](const char *name, QStyle::StandardPixmap bild, const QString &bedeutung) {
        auto *k = new QPushButton(this);
        k->setObjectName(QString::fromUtf8(name));
        k->setIcon(style()->standardIcon(bild));
        k->setIconSize(QSize(24, 24));
        k->setFixedSize(49, 33);
        k->setAccessibleName(bedeutung);
        return k;
    };

    m_labName = beschriftung("LabName", QStringLiteral("Name"));
    m_labVorname = beschriftung("LabVorname", QStringLiteral("Vorname"));
    m_labStrasse = beschriftung("LabStrasse", QStringLiteral("Straße"));
    m_labOrt = beschriftung("LabOrt", QStringLiteral("PLZ, Ort"));
    m_labTelefon = beschriftung("LabTelefon", QStringLiteral("Telefon"));
    m_txtName = feld("TxtName");
    m_txtVorname = feld("TxtVorname");
    m_txtStrasse = feld("TxtStrasse");
    m_txtOrt = feld("TxtOrt");
    m_txtTelefon = feld("TxtTelefon");
    m_checkOmi = haken("CheckOmi", QStringLiteral("Oberministrant"));
    m_checkNicht = haken("CheckNicht", QStringLiteral("nicht einteilen"));
    m_btnLoeschen = knopf("BtnLöschen", QStringLiteral("Löschen"));
    m_btnOK = knopf("BtnOK", QStringLiteral("OK"));
    m_btnHinzufuegen = knopf("BtnHinzufügen", QStringLiteral("Hinzufügen"));
    m_btnAbbruch = knopf("BtnAbbruch", QStringLiteral("Abbruch"));
    m_btnAlleTermineLoeschen = knopf("BtnAlleTermineLöschen", QStringLiteral("Alle Termine löschen"));

    auto *label1 = beschriftung("Label1", QStringLiteral("Folgende Wochentage werden ausgenommen:"));
    m_checkTag[2] = haken("CheckMontag", QStringLiteral("Montag"));
    m_checkTag[3] = haken("CheckDienstag", QStringLiteral("Dienstag"));
    m_checkTag[4] = haken("CheckMittwoch", QStringLiteral("Mittwoch"));
    m_checkTag[5] = haken("CheckDonnerstag", QStringLiteral("Donnerstag"));
    m_checkTag[6] = haken("CheckFreitag", QStringLiteral("Freitag"));
    m_checkTag[7] = haken("CheckSamstag", QStringLiteral("Samstag"));
    m_checkTag[1] = haken("CheckSonntag", QStringLiteral("Sonntag"));
    auto *label2 = beschriftung("Label2", QStringLiteral("Weitere Termine, die ausgenommen werden:"));
    // The two group captions are the widest texts of the page: with a large font they break
    // into two lines rather than widen the page beyond the main window.
    label1->setWordWrap(true);
    label2->setWordWrap(true);

    m_cmbTermine = new QComboBox(this);
    m_cmbTermine->setObjectName(QStringLiteral("CmbTermine"));
    m_cmbTermine->setEditable(true);
    // Entries are added only by our own Enter handling, and typing must not be completed
    // from the list: both would change the list behind the page's back.
    m_cmbTermine->setInsertPolicy(QComboBox::NoInsert);
    m_cmbTermine->setCompleter(nullptr);
    m_cmbTermine->setDuplicatesEnabled(true);
    NurCp1252(m_cmbTermine);
    QPalette grau = m_cmbTermine->palette();
    grau.setColor(QPalette::Base, QColor(0xC0, 0xC0, 0xC0));
    m_cmbTermine->setPalette(grau);
    m_cmbTermine->lineEdit()->setPalette(grau);
    m_cmbTermine->lineEdit()->installEventFilter(this);

    m_btnLeft = pfeil("BtnLeft", QStyle::SP_ArrowLeft, QStringLiteral("Zurück"));
    m_btnRight = pfeil("BtnRight", QStyle::SP_ArrowRight, QStringLiteral("Weiter"));
    m_btnBegin = pfeil("BtnBegin", QStyle::SP_ArrowUp, QStringLiteral("Anfang"));
    m_btnEnd = pfeil("BtnEnd", QStyle::SP_ArrowDown, QStringLiteral("Ende"));
    m_btnSuchen = knopf("BtnSuchen", QStringLiteral("Suchen"));
    m_btnSuchkriterien = knopf("BtnSuchkriterien", QStringLiteral("Suchkriterien"));

    auto *felder = new QGridLayout;
    felder->setColumnStretch(1, 1);
    const std::pair<QLabel *, QLineEdit *> zeilen[] = {{m_labName, m_txtName},
                                                       {m_labVorname, m_txtVorname},
                                                       {m_labStrasse, m_txtStrasse},
                                                       {m_labOrt, m_txtOrt},
                                                       {m_labTelefon, m_txtTelefon}};
    int zeile = 0;
    for (const auto &[label, text] : zeilen) {
        felder->addWidget(label, zeile, 0);
        felder->addWidget(text, zeile, 1);
        ++zeile;
    }
    auto *haken2 = new QHBoxLayout;
    haken2->addWidget(m_checkOmi);
    haken2->addWidget(m_checkNicht);
    auto *knoepfe = new QGridLayout;
    knoepfe->addWidget(m_btnLoeschen, 0, 0);
    knoepfe->addWidget(m_btnOK, 0, 1);
    knoepfe->addWidget(m_btnHinzufuegen, 1, 0);
    knoepfe->addWidget(m_btnAbbruch, 1, 1);
    knoepfe->addWidget(m_btnAlleTermineLoeschen, 2, 0, 1, 2);
    auto *links = new QVBoxLayout;
    links->addLayout(felder);
    links->addSpacing(8);
    links->addLayout(haken2);
    links->addSpacing(8);
    links->addLayout(knoepfe);
    links->addStretch(1);

    auto *tage = new QGridLayout;
    for (int d = 2; d <= 5; ++d)
        tage->addWidget(m_checkTag[d], d - 2, 0);
    tage->addWidget(m_checkTag[6], 0, 1);
    tage->addWidget(m_checkTag[7], 1, 1);
    tage->addWidget(m_checkTag[1], 2, 1);
    auto *pfeile = new QGridLayout;
    pfeile->addWidget(m_btnLeft, 0, 0);
    pfeile->addWidget(m_btnRight, 0, 1);
    pfeile->addWidget(m_btnBegin, 1, 0);
    pfeile->addWidget(m_btnEnd, 1, 1);
    auto *suche = new QVBoxLayout;
    suche->addWidget(m_btnSuchen);
    suche->addWidget(m_btnSuchkriterien);
    auto *unten = new QHBoxLayout;
    unten->addLayout(pfeile);
    unten->addStretch(1);
    unten->addLayout(suche);
    auto *rechts = new QVBoxLayout;
    rechts->addWidget(label1);
    rechts->addLayout(tage);
    rechts->addSpacing(8);
    rechts->addWidget(label2);
    rechts->addWidget(m_cmbTermine);
    rechts->addSpacing(8);
    rechts->addLayout(unten);
    rechts->addStretch(1);

    auto *haupt = new QHBoxLayout(this);
    haupt->addLayout(links, 0);
    haupt->addSpacing(12);
    haupt->addLayout(rechts, 1);

    QWidget *reihenfolge[] = {m_txtName, m_txtVorname, m_txtStrasse, m_txtOrt, m_txtTelefon, m_checkOmi,
                              m_checkTag[2], m_checkTag[3], m_checkTag[4], m_checkTag[5], m_checkTag[6],
                              m_checkTag[7], m_checkTag[1], m_cmbTermine, m_btnLeft, m_btnRight,
                              m_btnLoeschen, m_btnHinzufuegen, m_btnOK, m_btnAbbruch,
                              m_btnAlleTermineLoeschen, m_checkNicht, m_btnSuchen, m_btnSuchkriterien,
                              m_btnBegin, m_btnEnd};
    for (size_t i = 1; i < std::size(reihenfolge); ++i)
        setTabOrder(reihenfolge[i - 1], reihenfolge[i]);

    connect(m_btnOK, &QPushButton::clicked, this, &FrameMinis::BtnOK_Click);
    connect(m_btnAbbruch, &QPushButton::clicked, this, &FrameMinis::BtnAbbruch_Click);
    connect(m_btnHinzufuegen, &QPushButton::clicked, this, &FrameMinis::BtnHinzufuegen_Click);
    connect(m_btnLoeschen, &QPushButton::clicked, this, &FrameMinis::BtnLoeschen_Click);
    connect(m_btnAlleTermineLoeschen, &QPushButton::clicked, this, &FrameMinis::BtnAlleTermineLoeschen_Click);
    connect(m_btnBegin, &QPushButton::clicked, this, &FrameMinis::BtnBegin_Click);
    connect(m_btnLeft, &QPushButton::clicked, this, &FrameMinis::BtnLeft_Click);
    connect(m_btnRight, &QPushButton::clicked, this, &FrameMinis::BtnRight_Click);
    connect(m_btnEnd, &QPushButton::clicked, this, &FrameMinis::BtnEnd_Click);
    connect(m_btnSuchkriterien, &QPushButton::clicked, this, &FrameMinis::BtnSuchkriterien_Click);
    connect(m_btnSuchen, &QPushButton::clicked, this, &FrameMinis::BtnSuchen_Click);
    connect(m_cmbTermine, &QComboBox::activated, this, &FrameMinis::CmbTermine_Click);
    // Only edits by the user count as a change; texts the page sets itself are handled where
    // it sets them.
    connect(m_cmbTermine->lineEdit(), &QLineEdit::textEdited, this, &FrameMinis::CmbTermine_Change);
}

void FrameMinis::MnuListe_Click()
{
    m_hauptfenster.MenueDeaktivieren();
    show();
    AktiviereListe();
    AktMini = 0;
    // Sized afresh: a copy left smaller by deletions before an "Abbruch" must still hold the
    // whole roster.
    MinisKopie.assign(size_t(m_daten.AnzahlMinis) + 1, LeerMini);
    if (m_daten.AnzahlMinis < 1) {
        // Blank page, so the first record added does not take over what was shown last.
        AnzeigeDaten();
        DeaktiviereListe();
    } else {
        for (int i = 0; i < m_daten.AnzahlMinis; ++i)
            MinisKopie[i] = m_daten.Minis[i];
        AnzeigeDaten();
    }
    AnzahlKopie = m_daten.AnzahlMinis;
}

void FrameMinis::DatenGeladen()
{
    MinisKopie.assign(size_t(std::max<int16_t>(m_daten.AnzahlMinis, 0)) + 1, LeerMini);
}

void FrameMinis::AnzeigeDaten()
{
    const Mini &r = MinisKopie[AktMini];
    TerminAnzeige = true;
    m_txtName->setText(r.Name);
    m_txtVorname->setText(r.Vorname);
    m_txtStrasse->setText(r.Strasse);
    m_txtOrt->setText(r.Ort);
    m_txtTelefon->setText(r.Telefon);
    m_checkOmi->setChecked(r.Oberministrant);
    m_checkNicht->setChecked(r.NichtEinteilen);
    for (int d = 1; d <= 7; ++d)
        m_checkTag[d]->setChecked(r.Ausgenommen[d]);
    m_cmbTermine->clear();
    for (int k = 0; k < r.AnzahlTermine; ++k)
        m_cmbTermine->addItem(r.Termine[k]);
    TerminGewaehlt = true;
    TerminIndex = int16_t(m_cmbTermine->count() - 1);
    if (TerminIndex >= 0)
        m_cmbTermine->setCurrentIndex(TerminIndex);
    setzeEditText(TerminIndex >= 0 ? m_cmbTermine->itemText(TerminIndex) : QString());
}

void FrameMinis::LadeDaten()
{
    Mini &r = MinisKopie[AktMini];
    r.Name = m_txtName->text();
    r.Vorname = m_txtVorname->text();
    r.Strasse = m_txtStrasse->text();
    r.Ort = m_txtOrt->text();
    r.Telefon = m_txtTelefon->text();
    r.Oberministrant = m_checkOmi->isChecked();
    r.NichtEinteilen = m_checkNicht->isChecked();
    for (int d = 1; d <= 7; ++d)
        r.Ausgenommen[d] = m_checkTag[d]->isChecked();

    const int n = m_cmbTermine->count();
    if (n >= MaxTermine) {
        m_meldungen.zeige(QStringLiteral("Sie haben die Maximalzahl von 'Weitere Termine ...' ")
                              + QStringLiteral("überschritten. Diese beträgt ") + QStringLiteral(" 30")
                              + QStringLiteral(". Die Werte wurden nicht übernommen! ")
                              + QStringLiteral(" Dies kann daran liegen, daß Sie alte Termine nicht ")
                              + QStringLiteral("gelöscht haben. ")
                              + QStringLiteral("Bitte überprüfen Sie Ihre zuletzt bearbeitete Seite!"),
                          Knoepfe::OK, Symbol::Kritisch, TitelFehler);
        return;
    }
    // All or nothing: the message tells the user that the dates were not taken over, so the
    // record keeps its former list entirely instead of a mix of old and new entries.
    std::array<QString, MaxTermine> termine = r.Termine;
    for (int k = 0; k < n; ++k) {
        const QString eintrag = m_cmbTermine->itemText(k);
        if (eintrag.isEmpty()) {
            termine[k].clear();
            continue;
        }
        const auto normal = NormalisiereTermin(eintrag);
        if (!normal) {
            m_meldungen.zeige(QStringLiteral("Sie haben ungültige Werte bei 'Termine'")
                                  + QStringLiteral(" eingegeben. Diese wurden")
                                  + QStringLiteral(" nicht übernommen. Bitte überprüfen Sie Ihre")
                                  + QStringLiteral(" zuletzt bearbeitete Seite."),
                              Knoepfe::OK, Symbol::Keins, TitelFehler);
            return;
        }
        termine[k] = *normal;
    }
    r.Termine = termine;
    r.AnzahlTermine = int16_t(n);
}

QList<QWidget *> FrameMinis::listenSteuerelemente() const
{
    return {m_btnLoeschen, m_btnAlleTermineLoeschen, m_btnLeft, m_btnRight, m_btnBegin, m_btnEnd,
            m_btnSuchen, m_btnSuchkriterien, m_checkOmi, m_checkNicht, m_checkTag[2], m_checkTag[3],
            m_checkTag[4], m_checkTag[5], m_checkTag[6], m_checkTag[7], m_checkTag[1], m_cmbTermine,
            m_labName, m_labVorname, m_labStrasse, m_labOrt, m_labTelefon, m_txtName, m_txtVorname,
            m_txtStrasse, m_txtOrt, m_txtTelefon};
}

QList<QWidget *> FrameMinis::suchSperre() const
{
    return {m_btnLoeschen, m_btnAlleTermineLoeschen, m_btnLeft, m_btnRight, m_btnBegin, m_btnEnd,
            m_btnHinzufuegen, m_btnSuchkriterien, m_btnOK, m_btnAbbruch, m_checkOmi, m_checkNicht,
            m_checkTag[2], m_checkTag[3], m_checkTag[4], m_checkTag[5], m_checkTag[6], m_checkTag[7],
            m_checkTag[1], m_cmbTermine, m_labStrasse, m_labOrt, m_labTelefon, m_txtStrasse, m_txtOrt,
            m_txtTelefon};
}

void FrameMinis::AktiviereListe()
{
    for (QWidget *w : listenSteuerelemente())
        w->setEnabled(w != m_btnSuchen);
    m_txtName->setFocus();
}

void FrameMinis::DeaktiviereListe()
{
    for (QWidget *w : listenSteuerelemente())
        w->setEnabled(false);
    m_btnHinzufuegen->setFocus();
}

void FrameMinis::BtnBegin_Click()
{
    if (AnzahlKopie > 0) {
        LadeDaten();
        AktMini = 0;
        AnzeigeDaten();
        m_txtName->setFocus();
    }
}

void FrameMinis::BtnEnd_Click()
{
    if (AnzahlKopie > 0) {
        LadeDaten();
        AktMini = int16_t(AnzahlKopie - 1);
        AnzeigeDaten();
        m_txtName->setFocus();
    }
}

void FrameMinis::BtnLeft_Click()
{
    if (AktMini > 0) {
        LadeDaten();
        --AktMini;
        AnzeigeDaten();
    }
    m_txtName->setFocus();
}

void FrameMinis::BtnRight_Click()
{
    if (AnzahlKopie >= 1 && AktMini < AnzahlKopie - 1) {
        LadeDaten();
        ++AktMini;
        AnzeigeDaten();
    }
    m_txtName->setFocus();
}

void FrameMinis::BtnHinzufuegen_Click()
{
    // The count is a 16-bit value; there is no room for another record.
    if (AnzahlKopie == INT16_MAX)
        return;
    ++AnzahlKopie;
    MinisKopie.resize(size_t(AnzahlKopie) + 1);
    if (AnzahlKopie == 1)
        AktiviereListe();
    LadeDaten();
    AktMini = int16_t(AnzahlKopie - 1);
    AnzeigeDaten();
    m_txtName->setFocus();
}

void FrameMinis::BtnLoeschen_Click()
{
    if (m_meldungen.zeige(QStringLiteral("Soll Seite wirklich gelöscht werden?"), Knoepfe::JaNein, Symbol::Keins,
                          QStringLiteral("Löschen"))
        != Antwort::Ja)
        return;
    if (AnzahlKopie < 1)
        return;
    const int m = AnzahlKopie - 1;
    for (int i = AktMini; i < m; ++i)
        MinisKopie[i] = MinisKopie[i + 1];
    MinisKopie[m] = LeerMini;
    MinisKopie.resize(size_t(m) + 1);
    AnzahlKopie = int16_t(m);
    if (m > 0 && AktMini > m - 1)
        AktMini = int16_t(m - 1);
    AnzeigeDaten();
    if (m == 0)
        DeaktiviereListe();
}

void FrameMinis::BtnAlleTermineLoeschen_Click()
{
    if (m_meldungen.zeige(QStringLiteral("Sollen wirklich alle Termine gelöscht werden?"), Knoepfe::JaNein,
                          Symbol::Keins, QStringLiteral("Löschen"))
        != Antwort::Ja)
        return;
    for (int i = 0; i < AnzahlKopie; ++i) {
        for (QString &t : MinisKopie[i].Termine)
            t.clear();
        MinisKopie[i].AnzahlTermine = 0;
    }
    m_cmbTermine->clear();
    AnzeigeDaten();
}

void FrameMinis::BtnOK_Click()
{
    InitMini &d = m_daten;
    const size_t bisher = size_t(std::max<int>(d.AnzahlMinis, 0));
    d.AnzahlMinis = AnzahlKopie;
    if (AnzahlKopie >= 1) {
        LadeDaten();
        const size_t groesse = size_t(d.AnzahlMinis) + 1;
        d.Minis.resize(groesse);
        d.Sperre.resize(groesse, 0);
        d.Einsaetze.resize(groesse, 0);
        // A position that was not in use starts at 0: the spare element may still hold the
        // counters of a server deleted earlier.
        for (size_t i = bisher; i < groesse; ++i)
            d.Sperre[i] = d.Einsaetze[i] = 0;
        for (int i = 0; i < AnzahlKopie; ++i)
            d.Minis[i] = MinisKopie[i];
        Sortiere(0, d.AnzahlMinis - 1);
    }
    hide();
    m_hauptfenster.MenueAktivieren();
    d.Geaendert = true;
}

void FrameMinis::BtnAbbruch_Click()
{
    hide();
    m_hauptfenster.MenueAktivieren();
    for (Mini &m : MinisKopie)
        m = LeerMini;
}

// Hoare quicksort by family name directly followed by first name, compared by code value.
// Not stable; Sperre and Einsaetze stay where they are.
void FrameMinis::Sortiere(int L, int R)
{
    std::vector<Mini> &minis = m_daten.Minis;
    auto schluessel = [&minis](int x) { return minis[x].Name + minis[x].Vorname; };
    int i = L;
    int j = R;
    const QString pivot = schluessel((L + R) / 2);
    do {
        while (schluessel(i) < pivot)
            ++i;
        while (schluessel(j) > pivot)
            --j;
        if (i <= j) {
            if (i < j)
                std::swap(minis[i], minis[j]);
            ++i;
            --j;
        }
    } while (i <= j);
    if (L < j)
        Sortiere(L, j);
    if (i < R)
        Sortiere(i, R);
}

void FrameMinis::BtnSuchkriterien_Click()
{
    LadeDaten();
    for (QLineEdit *f : {m_txtName, m_txtVorname, m_txtStrasse, m_txtOrt, m_txtTelefon})
        f->clear();
    m_checkOmi->setChecked(false);
    m_checkNicht->setChecked(false);
    for (int d = 1; d <= 7; ++d)
        m_checkTag[d]->setChecked(false);
    m_cmbTermine->clear();
    for (QWidget *w : suchSperre())
        w->setEnabled(false);
    m_btnSuchen->setEnabled(true);
    m_txtName->setFocus();
}

// The loop runs over every record without stopping, so the last match in working-copy order
// wins; without a match AktMini stays as it was.
void FrameMinis::BtnSuchen_Click()
{
    const QString name = m_txtName->text();
    const QString vorname = m_txtVorname->text();
    const QString cN = name.toUpper();
    const QString cV = vorname.toUpper();
    for (int i = 0; i < AnzahlKopie; ++i) {
        const Mini &m = MinisKopie[i];
        if (cN.isEmpty() || cV.isEmpty()) {
            if (!cN.isEmpty() && PasstAnfang(m.Name, cN, name.size()))
                AktMini = int16_t(i);
            if (!cV.isEmpty() && PasstAnfang(m.Vorname, cV, vorname.size()))
                AktMini = int16_t(i);
        } else if (PasstAnfang(m.Name, cN, name.size()) && PasstAnfang(m.Vorname, cV, vorname.size())) {
            AktMini = int16_t(i);
        }
    }
    for (QWidget *w : suchSperre())
        w->setEnabled(true);
    m_btnSuchen->setEnabled(false);
    AnzeigeDaten();
    m_txtName->setFocus();
}

void FrameMinis::CmbTermine_Click(int index)
{
    TerminGewaehlt = true;
    TerminAnzeige = false;
    TerminIndex = int16_t(index);
}

void FrameMinis::CmbTermine_Change()
{
    if (!TerminGewaehlt || TerminAnzeige)
        return;
    if (TerminIndex >= 0 && TerminIndex < m_cmbTermine->count()) {
        // Removing the current entry makes the combo box show another one; the user's text stays.
        QLineEdit *edit = m_cmbTermine->lineEdit();
        const QString text = edit->text();
        const int cursor = edit->cursorPosition();
        m_cmbTermine->removeItem(TerminIndex);
        setzeEditText(text);
        edit->setCursorPosition(cursor);
    }
    TerminGewaehlt = false;
}

void FrameMinis::CmbTermine_Enter()
{
    const QString text = m_cmbTermine->lineEdit()->text();
    m_cmbTermine->addItem(text);
    setzeEditText(QString());
    // Emptying the edit text is a change of the text like any other.
    if (!text.isEmpty())
        CmbTermine_Change();
}

void FrameMinis::setzeEditText(const QString &text)
{
    m_cmbTermine->lineEdit()->setText(text);
}

bool FrameMinis::eventFilter(QObject *objekt, QEvent *ereignis)
{
    if (objekt == m_cmbTermine->lineEdit() && ereignis->type() == QEvent::KeyPress) {
        const int taste = static_cast<QKeyEvent *>(ereignis)->key();
        if (taste == Qt::Key_Return || taste == Qt::Key_Enter) {
            CmbTermine_Enter();
            return true;
        }
    }
    return QGroupBox::eventFilter(objekt, ereignis);
}

QSize FrameMinis::sizeHint() const
{
    return QGroupBox::sizeHint().expandedTo(QSize(613, 369));
}
