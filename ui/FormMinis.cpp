#include "ui/FormMinis.h"

#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "output/TextExport.h"
#include "ui/FormDrucken.h"
#include "ui/FormEinstellungen.h"
#include "ui/FormFileBrw.h"
#include "ui/FormInfo.h"
#include "ui/FormPlan.h"
#include "ui/FrameGodi.h"
#include "ui/FrameMinis.h"
#include "ui/FramePlan.h"
#include "ui/Hilfe.h"
#include "ui/Sekundaerfenster.h"
#include "ui/Werkzeugknopf.h"

#include <QApplication>
#include <QCloseEvent>
#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QMenuBar>
#include <QScreen>
#include <QTimer>
#include <QVBoxLayout>

namespace {

// F1 opens the help contents from every window of the program, also from secondary windows and
// while the main window is disabled, so it is caught for the whole application.
class HilfeTaste : public QObject
{
public:
    HilfeTaste(FormMinis &haupt) : QObject(&haupt), m_haupt(haupt) { qApp->installEventFilter(this); }
    ~HilfeTaste() override { qApp->removeEventFilter(this); }

protected:
    bool eventFilter(QObject *, QEvent *e) override
    {
        if (e->type() != QEvent::KeyPress)
            return false;
        auto *k = static_cast<QKeyEvent *>(e);
        if (k->key() != Qt::Key_F1 || k->modifiers() != Qt::NoModifier)
            return false;
        m_haupt.HilfeOeffnen();
        return true;
    }

private:
    FormMinis &m_haupt;
};

// Toolbar positions of the design (twips / 15): the gaps between the button groups.
constexpr int LinkerRand = 8;
constexpr int GruppenAbstand = 12;
constexpr int HilfeAbstand = 80;
constexpr int UhrAbstand = 68;

} // namespace

FormMinis::FormMinis(const Umgebung &umgebung, QWidget *parent)
    : QMainWindow(parent), m_umgebung(umgebung), m_generator(m_daten, umgebung.zufall)
{
    setObjectName(QStringLiteral("FormMinis"));
    setWindowTitle(QStringLiteral("Ministrantenplan"));
    QFont schrift = font();
    schrift.setBold(true);
    setFont(schrift);

    auto *mitte = new QWidget(this);
    mitte->setObjectName(QStringLiteral("Arbeitsbereich"));
    auto *spalte = new QVBoxLayout(mitte);
    spalte->setContentsMargins(0, 0, 0, 0);
    spalte->setSpacing(0);

    auto *leiste = new QFrame(mitte);
    leiste->setObjectName(QStringLiteral("Picture1"));
    leiste->setFrameShape(QFrame::Panel);
    leiste->setFrameShadow(QFrame::Raised);
    baueWerkzeugleiste(leiste);
    spalte->addWidget(leiste);

    // The three frames lie on top of each other below the toolbar; at most one is visible.
    auto *flaeche = new QWidget(mitte);
    flaeche->setObjectName(QStringLiteral("Rahmenflaeche"));
    auto *raster = new QGridLayout(flaeche);
    raster->setContentsMargins(8, 7, 8, 8);
    m_frameMinis = new FrameMinis(m_daten, m_umgebung.meldungen, *this, flaeche);
    m_frameGodi = new FrameGodi(m_daten, m_umgebung.meldungen, *this, flaeche);
    m_framePlan = new FramePlan(m_umgebung.meldungen, *this, m_generator, m_umgebung.uhr, flaeche);
    m_frameMinis->setObjectName(QStringLiteral("FrameMinis"));
    m_frameGodi->setObjectName(QStringLiteral("FrameGodi"));
    m_framePlan->setObjectName(QStringLiteral("FramePlan"));
    for (QWidget *rahmen : {static_cast<QWidget *>(m_frameMinis), static_cast<QWidget *>(m_frameGodi),
                            static_cast<QWidget *>(m_framePlan)}) {
        raster->addWidget(rahmen, 0, 0, Qt::AlignLeft | Qt::AlignTop);
        rahmen->hide();
    }
    spalte->addWidget(flaeche, 1);
    mitte->setMinimumSize(629, 421);   // the design's client area, 9435 x 6315 twips
    setCentralWidget(mitte);

    baueMenues();

    m_timerDatum = new QTimer(this);
    m_timerDatum->setObjectName(QStringLiteral("TimerDatum"));
    m_timerDatum->setInterval(1000);
    connect(m_timerDatum, &QTimer::timeout, this, &FormMinis::zeigeUhrzeit);
    m_timerDatum->start();
    zeigeUhrzeit();

    m_hilfeTaste = new HilfeTaste(*this);

    adjustSize();
    if (QScreen *bildschirm = screen()) {
        const QRect flaecheBildschirm = bildschirm->availableGeometry();
        move(flaecheBildschirm.x() + (flaecheBildschirm.width() - width()) / 2,
             flaecheBildschirm.y() + (flaecheBildschirm.height() - height()) / 2);
    }
    FormActivate();
}

FormMinis::~FormMinis()
{
    delete m_hilfeTaste;
}

void FormMinis::baueWerkzeugleiste(QWidget *leiste)
{
    struct Beschreibung {
        Knopf knopf;
        const char *name;
        Motiv motiv;
        const char *tooltip;
    };
    const Beschreibung knoepfe[] = {
        {Knopf::Open, "Open", Motiv::Oeffnen, "Öffnen"},
        {Knopf::Save, "Save", Motiv::Speichern, "Speichern"},
        {Knopf::Print, "Print", Motiv::Drucken, "Drucken"},
        {Knopf::Search, "Search", Motiv::Frage, "Einstellungen"},
        {Knopf::New, "New", Motiv::Blatt, "Plan anzeigen"},
        {Knopf::Help, "Help", Motiv::Hilfe, "Hilfe"},
    };
    auto *reihe = new QHBoxLayout(leiste);
    reihe->setContentsMargins(LinkerRand, 4, 8, 4);
    reihe->setSpacing(0);
    for (const Beschreibung &b : knoepfe) {
        auto *k = new Werkzeugknopf(QString::fromLatin1(b.name), b.motiv, QString::fromUtf8(b.tooltip),
                                    b.knopf != Knopf::Help, leiste);
        m_knoepfe[static_cast<int>(b.knopf)] = k;
        if (b.knopf == Knopf::Print || b.knopf == Knopf::Search || b.knopf == Knopf::New)
            reihe->addSpacing(GruppenAbstand);
        else if (b.knopf == Knopf::Help)
            reihe->addSpacing(HilfeAbstand);
        reihe->addWidget(k);
    }
    reihe->addSpacing(UhrAbstand);

    m_panelDatum = new QLabel(leiste);
    m_panelDatum->setObjectName(QStringLiteral("PanelDatum"));
    m_panelDatum->setFrameShape(QFrame::Panel);
    m_panelDatum->setFrameShadow(QFrame::Sunken);
    m_panelDatum->setAlignment(Qt::AlignCenter);
    // Wide enough for the longest date and time text in the window's font.
    m_panelDatum->setMinimumWidth(qMax(145, m_panelDatum->fontMetrics().horizontalAdvance(
                                                QStringLiteral("00.00.0000 00:00:00")) + 16));
    reihe->addWidget(m_panelDatum);
    reihe->addStretch(1);

    connect(&knopf(Knopf::Open), &Werkzeugknopf::geklickt, this, &FormMinis::DateiOeffnen);
    connect(&knopf(Knopf::Save), &Werkzeugknopf::geklickt, this, [this] { Speichern(); });
    connect(&knopf(Knopf::Print), &Werkzeugknopf::geklickt, this, &FormMinis::Drucken);
    connect(&knopf(Knopf::Search), &Werkzeugknopf::geklickt, this, &FormMinis::Einstellungen);
    connect(&knopf(Knopf::New), &Werkzeugknopf::geklickt, this, &FormMinis::AnzeigePlan);
    connect(&knopf(Knopf::Help), &Werkzeugknopf::geklickt, this, &FormMinis::HilfeOeffnen);

    knopf(Knopf::Save).setzeVerfuegbar(false);
    knopf(Knopf::Print).setzeVerfuegbar(false);
    knopf(Knopf::New).setzeVerfuegbar(false);
}

QMenu *FormMinis::menue(const QString &name, const QString &text)
{
    QMenu *m = menuBar()->addMenu(text);
    m->setObjectName(name);
    m->menuAction()->setObjectName(name + QStringLiteral("Aktion"));
    return m;
}

QAction *FormMinis::eintrag(QMenu *menu, const QString &name, const QString &text, std::function<void()> aktion)
{
    QAction *a = menu->addAction(text);
    a->setObjectName(name);
    // A shortcut reaches an item even while its menu is disabled; the item acts only when both
    // are enabled, as a click in the menu would.
    connect(a, &QAction::triggered, this, [a, menu, aktion = std::move(aktion)] {
        if (a->isEnabled() && menu->menuAction()->isEnabled())
            aktion();
    });
    return a;
}

void FormMinis::baueMenues()
{
    QMenu *datei = menue(QStringLiteral("MnuDatei"), QStringLiteral("&Datei"));
    QAction *laden = eintrag(datei, QStringLiteral("MnuLaden"), QStringLiteral("Datei &öffnen ..."),
                             [this] { DateiOeffnen(); });
    laden->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_O));
    QAction *speichern = eintrag(datei, QStringLiteral("MnuSpeichern"), QStringLiteral("&Speichern"),
                                 [this] { Speichern(); });
    speichern->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_S));
    eintrag(datei, QStringLiteral("MnuSpeichernUnter"), QStringLiteral("Speichern &unter ..."),
            [this] { SpeichernUnter(); });
    datei->addSeparator()->setObjectName(QStringLiteral("MnuSep0"));
    eintrag(datei, QStringLiteral("MnuAdressenSpeichern"), QStringLiteral("A&dressliste als Text speichern"),
            [this] {
                AdresslisteAlsTextSpeichern(m_daten, m_umgebung.meldungen, m_umgebung.uhr.jetzt().date());
            });
    eintrag(datei, QStringLiteral("MnuPlanSpeichern"), QStringLiteral("&Plan als Text speichern"),
            [this] { PlanAlsTextSpeichern(m_daten, m_umgebung.meldungen); });
    datei->addSeparator()->setObjectName(QStringLiteral("MnuSep1"));
    QAction *drucken = eintrag(datei, QStringLiteral("MnuDrucken"), QStringLiteral("&Drucken ..."),
                               [this] { Drucken(); });
    drucken->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_P));
    eintrag(datei, QStringLiteral("MnuPdfSpeichern"), QStringLiteral("Als &PDF speichern ..."),
            [this] { AlsPdfSpeichern(); });
    datei->addSeparator()->setObjectName(QStringLiteral("MnuSep2"));
    QAction *beenden = eintrag(datei, QStringLiteral("MnuProgrammBeenden"), QStringLiteral("Programm &beenden"),
                               [this] { ProgrammBeenden(); });
    beenden->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_Q));

    QMenu *bearbeiten = menue(QStringLiteral("MnuBearbeiten"), QStringLiteral("&Bearbeiten"));
    eintrag(bearbeiten, QStringLiteral("MnuListe"), QStringLiteral("&Liste ..."),
            [this] { m_frameMinis->MnuListe_Click(); });
    eintrag(bearbeiten, QStringLiteral("MnuTermine"), QStringLiteral("&Termine ..."),
            [this] { m_frameGodi->MnuTermine_Click(); });

    QMenu *ansicht = menue(QStringLiteral("MnuAnsicht"), QStringLiteral("An&sicht"));
    eintrag(ansicht, QStringLiteral("MnuPlanAnzeigen"), QStringLiteral("Plan &anzeigen"), [this] { AnzeigePlan(); });

    QMenu *ausfuehren = menue(QStringLiteral("MnuAusführen"), QStringLiteral("&Ausführen"));
    eintrag(ausfuehren, QStringLiteral("MnuPlanErstellen"), QStringLiteral("&Plan erstellen ..."),
            [this] { m_framePlan->MnuPlanErstellen_Click(); });

    QMenu *optionen = menue(QStringLiteral("MnuOptionen"), QStringLiteral("&Optionen"));
    eintrag(optionen, QStringLiteral("MnuEinstellungen"), QStringLiteral("Einstellungen ..."),
            [this] { Einstellungen(); });

    QMenu *hilfe = menue(QStringLiteral("MnuHilfe"), QStringLiteral("&Hilfe"));
    eintrag(hilfe, QStringLiteral("MnuInhalt"), QStringLiteral("I&nhalt - F1"), [this] { HilfeOeffnen(); });
    eintrag(hilfe, QStringLiteral("MnuHilfeZurHilfe"), QStringLiteral("Hilfe &zur Hilfe"),
            [this] { HilfeZurHilfe(); });
    hilfe->addSeparator()->setObjectName(QStringLiteral("MnuSep3"));
    eintrag(hilfe, QStringLiteral("MnuInfo"), QStringLiteral("&Info"), [this] { Information(); });

    for (const char *name : {"MnuSpeichern", "MnuSpeichernUnter", "MnuAdressenSpeichern", "MnuPlanSpeichern",
                             "MnuDrucken", "MnuPdfSpeichern"})
        setzeMenueaktion(QString::fromLatin1(name), false);
    setzeMenue(QStringLiteral("MnuAnsicht"), false);
    setzeMenue(QStringLiteral("MnuAusführen"), false);
}

void FormMinis::setzeMenueaktion(const QString &name, bool an)
{
    if (auto *a = findChild<QAction *>(name))
        a->setEnabled(an);
}

void FormMinis::setzeMenue(const QString &name, bool an)
{
    // The menu itself, not only its entry in the menu bar: a menu re-enables its entry whenever
    // its own enabled state changes, which happens each time the main window is enabled again.
    if (auto *m = findChild<QMenu *>(name))
        m->setEnabled(an);
}

Werkzeugknopf &FormMinis::knopf(Knopf k) const
{
    return *m_knoepfe[static_cast<int>(k)];
}

void FormMinis::zeigeUhrzeit()
{
    m_panelDatum->setText(m_umgebung.uhr.jetzt().toString(QStringLiteral("dd.MM.yyyy hh:mm:ss")));
}

void FormMinis::MenueDeaktivieren()
{
    for (const char *name : {"MnuSpeichern", "MnuSpeichernUnter", "MnuAdressenSpeichern", "MnuPlanSpeichern",
                             "MnuDrucken", "MnuPdfSpeichern"})
        setzeMenueaktion(QString::fromLatin1(name), false);
    for (const QString &name : {QStringLiteral("MnuDatei"), QStringLiteral("MnuBearbeiten"),
                                QStringLiteral("MnuAnsicht"), QStringLiteral("MnuAusführen"),
                                QStringLiteral("MnuOptionen")})
        setzeMenue(name, false);
    for (Knopf k : {Knopf::Open, Knopf::Save, Knopf::Print, Knopf::Search, Knopf::New})
        knopf(k).setzeVerfuegbar(false);
}

void FormMinis::MenueAktivieren()
{
    // Only ever enables: what a condition does not cover keeps its state.
    for (const char *name : {"MnuDatei", "MnuBearbeiten", "MnuOptionen"})
        setzeMenue(QString::fromLatin1(name), true);
    knopf(Knopf::Open).setzeVerfuegbar(true);
    knopf(Knopf::Search).setzeVerfuegbar(true);

    if (m_daten.AnzahlMinis > 0) {
        for (const char *name : {"MnuSpeichern", "MnuSpeichernUnter", "MnuAdressenSpeichern",
                                 "MnuPlanSpeichern", "MnuDrucken", "MnuPdfSpeichern"})
            setzeMenueaktion(QString::fromLatin1(name), true);
        setzeMenue(QStringLiteral("MnuAusführen"), true);
        knopf(Knopf::Save).setzeVerfuegbar(true);
        knopf(Knopf::Print).setzeVerfuegbar(true);
    }
    if (m_daten.AnzahlPlanEintraege > 0) {
        setzeMenue(QStringLiteral("MnuAnsicht"), true);
        knopf(Knopf::New).setzeVerfuegbar(true);
    }
}

bool FormMinis::Laden()
{
    const bool gelesen = ::Laden(m_daten, m_umgebung.meldungen);
    setWindowTitle(Fenstertitel(m_daten));
    if (!gelesen)
        return false;
    m_frameMinis->DatenGeladen();
    m_frameGodi->DatenGeladen();
    MenueAktivieren();
    if (m_daten.AnzahlPlanEintraege < 1) {
        setzeMenue(QStringLiteral("MnuAnsicht"), false);
        knopf(Knopf::New).setzeVerfuegbar(false);
    }
    return true;
}

SpeicherErgebnis FormMinis::Speichern(bool speichernUnter)
{
    if (!m_daten.Geaendert)
        return SpeicherErgebnis::NichtsGeaendert;
    Werkzeugknopf &save = knopf(Knopf::Save);
    const bool warGedrueckt = save.gedrueckt();
    save.setzeGedrueckt(true);
    save.repaint();
    const SpeicherErgebnis ergebnis = ::Speichern(m_daten, m_umgebung.meldungen, speichernUnter);
    save.setzeGedrueckt(warGedrueckt);
    setWindowTitle(Fenstertitel(m_daten));
    return ergebnis;
}

void FormMinis::ZeigeSekundaer(QWidget *fenster, std::optional<Knopf> gedrueckt,
                               std::function<void()> beimSchliessen)
{
    if (gedrueckt)
        knopf(*gedrueckt).setzeGedrueckt(true);
    ZeigeSekundaerfenster(fenster, this, [this, gedrueckt, beimSchliessen = std::move(beimSchliessen)] {
        if (gedrueckt)
            knopf(*gedrueckt).setzeGedrueckt(false);
        if (beimSchliessen)
            beimSchliessen();
        FormActivate();
    });
}

void FormMinis::DateiOeffnen()
{
    m_daten.DateiLaden = true;
    knopf(Knopf::Open).setzeGedrueckt(true);
    ZeigeDateibrowser(QStringLiteral("Datei öffnen"));
}

void FormMinis::SpeichernUnter()
{
    m_daten.DateiSpeichernUnter = true;
    ZeigeDateibrowser(QStringLiteral("Datei speichern unter"));
    knopf(Knopf::Save).setzeGedrueckt(true);
}

// The browser acts on DateiLaden / DateiSpeichernUnter when its OK is clicked.
void FormMinis::ZeigeDateibrowser(const QString &titel)
{
    auto *browser = new FormFileBrw(m_daten, m_umgebung.meldungen,
                                    DateiProzeduren{[this] { return Laden(); },
                                                    [this](bool unter) { return Speichern(unter); }},
                                    m_umgebung.programmOrdner);
    ZeigeSekundaer(browser, std::nullopt, [this] {
        knopf(Knopf::Open).setzeGedrueckt(false);
        knopf(Knopf::Save).setzeGedrueckt(false);
    });
    browser->setWindowTitle(titel);
}

bool FormMinis::BeendenBestaetigt()
{
    Meldungen &m = m_umgebung.meldungen;
    const QString titel = QStringLiteral("Programm beenden");
    if (m_daten.Geaendert) {
        const Antwort a = m.zeige(QStringLiteral("Sollen Änderungen in ") + m_daten.Dateiname.toUpper() +
                                      QStringLiteral(" gesichert werden?"),
                                  Knoepfe::JaNeinAbbrechen, Symbol::Keins, titel);
        // A failed save keeps the program open: the user has seen why and can save elsewhere.
        if (a == Antwort::Ja)
            return Speichern() != SpeicherErgebnis::Fehlgeschlagen;
        return a == Antwort::Nein;
    }
    return m.zeige(QStringLiteral("Soll das Programm beendet werden?"), Knoepfe::JaNein, Symbol::Keins, titel) ==
           Antwort::Ja;
}

void FormMinis::ProgrammBeenden()
{
    if (BeendenBestaetigt())
        Beenden();
}

void FormMinis::Beenden()
{
    m_beendet = true;
    m_timerDatum->stop();
    close();
    emit ProgrammEnde();
}

void FormMinis::closeEvent(QCloseEvent *event)
{
    if (m_beendet) {
        event->accept();
        return;
    }
    // The close box asks exactly what "Programm beenden" asks. While a secondary window is
    // open the main window takes no input, its close box included.
    if (!isEnabled() || !BeendenBestaetigt()) {
        event->ignore();
        return;
    }
    m_beendet = true;
    m_timerDatum->stop();
    event->accept();
    emit ProgrammEnde();
}

void FormMinis::changeEvent(QEvent *event)
{
    QMainWindow::changeEvent(event);
    // A disabled main window can still be activated by the window system while a secondary
    // window is open; the browser flags must survive that.
    if (event->type() == QEvent::ActivationChange && isActiveWindow() && isEnabled())
        FormActivate();
}

void FormMinis::FormActivate()
{
    m_daten.DateiLaden = false;
    m_daten.DateiSpeichernUnter = false;
    setWindowTitle(Fenstertitel(m_daten));
}

void FormMinis::Einstellungen()
{
    ZeigeSekundaer(new FormEinstellungen(m_daten, m_umgebung.meldungen), Knopf::Search);
}

void FormMinis::AnzeigePlan()
{
    ZeigeSekundaer(new FormPlan(m_daten), Knopf::New);
}

void FormMinis::Information()
{
    ZeigeSekundaer(new FormInfo(*this, m_umgebung.hilfe, m_umgebung.programmOrdner), std::nullopt);
}

void FormMinis::HilfeOeffnen()
{
    m_umgebung.hilfe.ZeigeInhalt();
}

void FormMinis::HilfeZurHilfe()
{
    m_umgebung.hilfe.ZeigeHilfeZurHilfe();
}

void FormMinis::Drucken()
{
    if (auto *dialog = FormDrucken::Laden(m_daten, m_umgebung.meldungen, m_umgebung.uhr))
        ZeigeSekundaer(dialog, Knopf::Print);
}

void FormMinis::AlsPdfSpeichern()
{
    const QString pfad = PfadNebenDatei(m_daten.Dateiname, QStringLiteral("PLAN.PDF"));
    if (auto *dialog = FormDrucken::Laden(m_daten, m_umgebung.meldungen, m_umgebung.uhr, pfad))
        ZeigeSekundaer(dialog, Knopf::Print);
}
