#include "ui/FormFileBrw.h"

#include "data/InitMini.h"
#include "data/Meldungen.h"

#include <QComboBox>
#include <QDir>
#include <QEvent>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QPushButton>
#include <QScrollBar>
#include <QTimer>
#include <QTreeView>
#include <QVBoxLayout>

namespace {

const QString PlanMuster = QStringLiteral("*.prd");
const QString AlleMuster = QStringLiteral("*.*");

bool istRoot(const QString &pfad)
{
    return pfad.endsWith(QLatin1Char('/')) || pfad.endsWith(QLatin1Char('\\'));
}

// "*.*" means every file, also one without an extension, as on the systems the data files
// come from.
QString qtMuster(const QString &muster)
{
    return muster == QLatin1String("*.*") ? QStringLiteral("*") : muster;
}

bool hatMuster(const QString &name)
{
    return name.contains(QLatin1Char('*')) || name.contains(QLatin1Char('?')) || name.contains(QLatin1Char('['));
}

// A name of one file in the folder, as the systems the data files come from accept it.
bool brauchbarerName(const QString &name)
{
    static const QString verboten = QStringLiteral("/\\*?\"<>|");
    if (name.trimmed().isEmpty() || name == QLatin1String(".") || name == QLatin1String(".."))
        return false;
    for (QChar c : name) {
        if (verboten.contains(c) || c.unicode() < 32)
            return false;
    }
    return true;
}

QString laufwerksName(const QString &wurzel)
{
    QString name = QDir::toNativeSeparators(wurzel);
    while (name.size() > 1 && (name.endsWith(QLatin1Char('/')) || name.endsWith(QLatin1Char('\\'))))
        name.chop(1);
    return name;
}

// The folder path as shown: a path's last component, elided in the middle when too long.
class PfadLabel : public QLabel
{
public:
    using QLabel::QLabel;
    void setzePfad(const QString &pfad)
    {
        m_pfad = pfad;
        setToolTip(pfad);
        kuerze();
    }

protected:
    void resizeEvent(QResizeEvent *event) override
    {
        QLabel::resizeEvent(event);
        kuerze();
    }

private:
    void kuerze() { setText(fontMetrics().elidedText(m_pfad, Qt::ElideMiddle, qMax(0, width() - 2))); }
    QString m_pfad;
};

} // namespace

QStringList SystemLaufwerke()
{
    QStringList wurzeln;
    for (const QFileInfo &info : QDir::drives())
        wurzeln << info.absoluteFilePath();
    return wurzeln;
}

std::optional<QString> FindeDatei(const QString &ordner, const QString &name)
{
    if (name.isEmpty() || name.contains(QLatin1Char('/')) || name.contains(QLatin1Char('\\')))
        return std::nullopt;
    const QDir dir(ordner);
    if (!hatMuster(name)) {
        if (QFileInfo(dir.filePath(name)).isFile())
            return name;
    }
    // Among the files the list shows: a pattern must not pick a hidden file the user cannot see.
    const QStringList treffer = dir.entryList(QStringList{qtMuster(name)}, QDir::Files, QDir::Name | QDir::IgnoreCase);
    if (treffer.isEmpty())
        return std::nullopt;
    return treffer.front();
}

FormFileBrw::FormFileBrw(InitMini &daten, Meldungen &meldungen, DateiProzeduren prozeduren,
                         const QString &programmOrdner, const QStringList &laufwerke, QWidget *parent)
    : QDialog(parent), m_daten(daten), m_meldungen(meldungen), m_prozeduren(std::move(prozeduren)),
      m_programmOrdner(QDir::cleanPath(programmOrdner)), m_laufwerke(laufwerke)
{
    setObjectName(QStringLiteral("FormFileBrw"));
    if (m_laufwerke.isEmpty())
        m_laufwerke << QDir::rootPath();

    auto *labDatei = new QLabel(QStringLiteral("Dateiname:"), this);
    labDatei->setObjectName(QStringLiteral("LabDatei"));
    m_txtDatei = new QLineEdit(this);
    m_txtDatei->setObjectName(QStringLiteral("TxtDatei"));

    m_dateiModell = new QFileSystemModel(this);
    m_dateiModell->setFilter(QDir::Files | QDir::NoDotAndDotDot);
    m_dateiModell->setNameFilterDisables(false);
    m_fileList = new QListView(this);
    m_fileList->setObjectName(QStringLiteral("FileList"));
    m_fileList->setModel(m_dateiModell);
    m_fileList->setEditTriggers(QAbstractItemView::NoEditTriggers);

    auto *labDateiFormat = new QLabel(QStringLiteral("Dateiformat:"), this);
    labDateiFormat->setObjectName(QStringLiteral("LabDateiFormat"));
    m_cmbDateiFormat = new QComboBox(this);
    m_cmbDateiFormat->setObjectName(QStringLiteral("CmbDateiFormat"));

    auto *labVerzeichnis = new QLabel(QStringLiteral("Verzeichnisse:"), this);
    labVerzeichnis->setObjectName(QStringLiteral("LabVerzeichnis"));
    auto *labVerzStruk = new PfadLabel(this);
    m_labVerzStruk = labVerzStruk;
    m_labVerzStruk->setObjectName(QStringLiteral("LabVerzStruk"));
    m_labVerzStruk->setMinimumWidth(209);
    m_labVerzStruk->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);

    m_ordnerModell = new QFileSystemModel(this);
    m_ordnerModell->setFilter(QDir::AllDirs | QDir::Drives | QDir::NoDotAndDotDot);
    m_ordnerModell->setRootPath(QString());
    m_dirList = new QTreeView(this);
    m_dirList->setObjectName(QStringLiteral("DirList"));
    m_dirList->setModel(m_ordnerModell);
    m_dirList->setHeaderHidden(true);
    for (int spalte = 1; spalte < m_ordnerModell->columnCount(); ++spalte)
        m_dirList->hideColumn(spalte);
    m_dirList->setEditTriggers(QAbstractItemView::NoEditTriggers);

    m_labLaufwerk = new QLabel(QStringLiteral("Laufwerke:"), this);
    m_labLaufwerk->setObjectName(QStringLiteral("LabLaufwerk"));
    m_driveList = new QComboBox(this);
    m_driveList->setObjectName(QStringLiteral("DriveList"));
    for (const QString &wurzel : m_laufwerke)
        m_driveList->addItem(laufwerksName(wurzel));
    // Where the system has a single root there is nothing to choose.
    m_labLaufwerk->setVisible(m_laufwerke.size() > 1);
    m_driveList->setVisible(m_laufwerke.size() > 1);

    m_cmdOK = new QPushButton(QStringLiteral("OK"), this);
    m_cmdOK->setObjectName(QStringLiteral("CmdOK"));
    m_cmdOK->setDefault(true);
    m_cmdAbbruch = new QPushButton(QStringLiteral("Abbruch"), this);
    m_cmdAbbruch->setObjectName(QStringLiteral("CmdAbbruch"));
    m_cmdAbbruch->setAutoDefault(false);
    for (QPushButton *k : {m_cmdOK, m_cmdAbbruch})
        k->setMinimumWidth(97);   // 1455 twips

    auto *raster = new QGridLayout(this);
    raster->setContentsMargins(16, 16, 16, 16);
    raster->setHorizontalSpacing(18);
    raster->setVerticalSpacing(4);
    raster->addWidget(labDatei, 0, 0);
    raster->addWidget(m_txtDatei, 1, 0);
    raster->addWidget(m_fileList, 2, 0);
    raster->addWidget(labDateiFormat, 3, 0);
    raster->addWidget(m_cmbDateiFormat, 4, 0);
    raster->addWidget(labVerzeichnis, 0, 1);
    raster->addWidget(m_labVerzStruk, 1, 1);
    raster->addWidget(m_dirList, 2, 1);
    raster->addWidget(m_labLaufwerk, 3, 1);
    raster->addWidget(m_driveList, 4, 1);
    auto *knoepfe = new QVBoxLayout;
    knoepfe->addWidget(m_cmdOK);
    knoepfe->addWidget(m_cmdAbbruch);
    knoepfe->addStretch(1);
    raster->addLayout(knoepfe, 2, 2, 3, 1);
    raster->setRowStretch(2, 1);
    raster->setColumnStretch(0, 1);
    raster->setColumnStretch(1, 1);
    m_fileList->setMinimumSize(217, 140);
    m_dirList->setMinimumSize(209, 140);

    setTabOrder(m_cmbDateiFormat, m_txtDatei);
    setTabOrder(m_txtDatei, m_fileList);
    setTabOrder(m_fileList, m_dirList);
    setTabOrder(m_dirList, m_driveList);
    setTabOrder(m_driveList, m_cmdOK);
    setTabOrder(m_cmdOK, m_cmdAbbruch);

    connect(m_cmdOK, &QPushButton::clicked, this, &FormFileBrw::CmdOK_Click);
    connect(m_cmdAbbruch, &QPushButton::clicked, this, &QWidget::close);
    connect(m_fileList, &QListView::clicked, this, &FormFileBrw::FileList_Click);
    connect(m_fileList, &QListView::doubleClicked, this, [this](const QModelIndex &) { CmdOK_Click(); });
    connect(m_dirList->selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex &aktuell) { DirList_Change(aktuell); });
    connect(m_txtDatei, &QLineEdit::textChanged, this, &FormFileBrw::TxtDatei_Change);
    connect(m_driveList, &QComboBox::currentIndexChanged, this, &FormFileBrw::DriveList_Change);
    // The tree fills and sorts itself in the background, which moves the rows; until the user
    // touches the tree, the open folder is kept in view.
    m_nachfuehren = new QTimer(this);
    m_nachfuehren->setSingleShot(true);
    m_nachfuehren->setInterval(0);
    connect(m_nachfuehren, &QTimer::timeout, this, [this] {
        m_dirList->scrollTo(m_dirList->currentIndex(), QAbstractItemView::PositionAtCenter);
    });
    connect(m_ordnerModell, &QAbstractItemModel::layoutChanged, m_nachfuehren, qOverload<>(&QTimer::start));
    connect(m_ordnerModell, &QAbstractItemModel::rowsInserted, m_nachfuehren, qOverload<>(&QTimer::start));
    m_dirList->viewport()->installEventFilter(this);
    m_dirList->verticalScrollBar()->installEventFilter(this);

    // Form_Load: the first drive at its root, the data file pattern, then the format list.
    waehleLaufwerk(0);
    setzeMuster(PlanMuster);
    m_txtDatei->setText(PlanMuster);
    m_cmbDateiFormat->addItem(QStringLiteral("Planformat (*.prd)"));
    m_cmbDateiFormat->addItem(QStringLiteral("Alle Dateien (*.*)"));
    connect(m_cmbDateiFormat, &QComboBox::currentIndexChanged, this, &FormFileBrw::CmbDateiFormat_Click);
    m_cmbDateiFormat->setCurrentIndex(0);
    CmbDateiFormat_Click(0);
    m_letztesGutesLaufwerk = 0;
    ChangePath();

    resize(sizeHint().expandedTo(QSize(594, 300)));
}

void FormFileBrw::showEvent(QShowEvent *event)
{
    QDialog::showEvent(event);
    if (!m_aktiviert) {
        m_aktiviert = true;
        FormActivate();
    }
}

bool FormFileBrw::eventFilter(QObject *objekt, QEvent *event)
{
    const auto art = event->type();
    if (art == QEvent::MouseButtonPress || art == QEvent::Wheel || art == QEvent::KeyPress) {
        m_ordnerModell->disconnect(m_nachfuehren);
        m_nachfuehren->stop();
    }
    return QDialog::eventFilter(objekt, event);
}

void FormFileBrw::FormActivate()
{
    m_daten.AlterDateiname = m_daten.Dateiname;
    const int laufwerk = laufwerkVon(m_programmOrdner);
    if (laufwerk != m_driveList->currentIndex()) {
        const QSignalBlocker sperre(m_driveList);
        m_driveList->setCurrentIndex(laufwerk);
        m_letztesGutesLaufwerk = laufwerk;
    }
    oeffneOrdner(m_programmOrdner);
}

int FormFileBrw::laufwerkVon(const QString &ordner) const
{
    int bestes = 0;
    int laenge = -1;
    for (int i = 0; i < m_laufwerke.size(); ++i) {
        const QString wurzel = QDir::cleanPath(m_laufwerke[i]);
        const bool passt = ordner.compare(wurzel, Qt::CaseInsensitive) == 0 ||
                           ordner.startsWith(istRoot(wurzel) ? wurzel : wurzel + QLatin1Char('/'), Qt::CaseInsensitive);
        if (passt && wurzel.size() > laenge) {
            bestes = i;
            laenge = wurzel.size();
        }
    }
    return bestes;
}

void FormFileBrw::oeffneOrdner(const QString &ordner)
{
    const QModelIndex index = m_ordnerModell->index(QDir::cleanPath(ordner));
    if (!index.isValid())
        return;
    for (QModelIndex oben = index.parent(); oben.isValid(); oben = oben.parent())
        m_dirList->expand(oben);
    m_dirList->setCurrentIndex(index);
    m_dirList->scrollTo(index, QAbstractItemView::PositionAtCenter);
    // setCurrentIndex reports no change when the index was current already.
    if (m_pfad != QDir::cleanPath(ordner))
        DirList_Change(index);
}

void FormFileBrw::waehleLaufwerk(int index)
{
    oeffneOrdner(m_laufwerke.value(index));
}

void FormFileBrw::ChangePath()
{
    static_cast<PfadLabel *>(m_labVerzStruk)->setzePfad(QDir::toNativeSeparators(m_pfad));
    m_dateiModell->setRootPath(m_pfad);
    m_fileList->setRootIndex(m_dateiModell->index(m_pfad));
}

void FormFileBrw::DirList_Change(const QModelIndex &index)
{
    if (!index.isValid())
        return;
    m_pfad = QDir::cleanPath(m_ordnerModell->filePath(index));
    ChangePath();
}

void FormFileBrw::DriveList_Change(int index)
{
    const QString wurzel = m_laufwerke.value(index);
    const QFileInfo info(wurzel);
    if (!info.isDir() || !info.isReadable()) {
        const QString name = laufwerksName(wurzel).toUpper();
        m_meldungen.zeige(QStringLiteral("Laufwerk ") + name +
                              QStringLiteral(" antwortet nicht! Prüfen Sie, ob ein Datenträger eingelegt ist, "
                                             "oder ob das Laufwerk existiert."),
                          Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Fehler bei Laufwerk ") + name);
        const QSignalBlocker sperre(m_driveList);
        m_driveList->setCurrentIndex(m_letztesGutesLaufwerk);
        return;
    }
    waehleLaufwerk(index);
    m_letztesGutesLaufwerk = index;
}

void FormFileBrw::FileList_Click(const QModelIndex &index)
{
    if (index.isValid())
        m_txtDatei->setText(m_dateiModell->fileName(index));
}

void FormFileBrw::setzeMuster(const QString &muster)
{
    const bool neu = muster != m_muster;
    m_muster = muster;
    m_dateiModell->setNameFilters(QStringList{qtMuster(muster)});
    if (neu)
        FileList_PatternChange();
}

void FormFileBrw::FileList_PatternChange()
{
    m_txtDatei->setText(m_muster);
}

void FormFileBrw::TxtDatei_Change(const QString &text)
{
    if (text == AlleMuster) {
        setzeMuster(AlleMuster);
        m_cmbDateiFormat->setCurrentIndex(1);
    }
}

void FormFileBrw::CmbDateiFormat_Click(int index)
{
    setzeMuster(index == 0 ? PlanMuster : AlleMuster);
}

void FormFileBrw::MeldeDateiUngueltig()
{
    m_meldungen.zeige(QStringLiteral("Datei befindet sich nicht in diesem Verzeichnis oder der Dateiname ist ungültig!"),
                      Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Ungültiger Dateiname"));
}

void FormFileBrw::CmdOK_Click()
{
    const QString trenner = istRoot(m_pfad) ? QString() : QStringLiteral("/");
    const QString name = m_txtDatei->text();

    if (m_daten.DateiLaden) {
        // Changes the user declined to save are dropped only when another file really replaces
        // them; if nothing is loaded they stay, still marked as unsaved.
        bool verworfen = false;
        if (m_daten.Geaendert) {
            const QString behalten = m_daten.Dateiname;
            m_daten.Dateiname = m_daten.AlterDateiname;
            const Antwort a = m_meldungen.zeige(QStringLiteral("Sollen Änderungen in ") + m_daten.Dateiname.toUpper() +
                                                    QStringLiteral(" gesichert werden?"),
                                                Knoepfe::JaNein, Symbol::Keins, QStringLiteral("Datei öffnen"));
            if (a == Antwort::Ja) {
                // A failed save has been reported; loading now would throw the data away.
                if (m_prozeduren.speichern(false) == SpeicherErgebnis::Fehlgeschlagen) {
                    m_daten.Dateiname = behalten;
                    return;
                }
            } else {
                verworfen = true;
            }
            m_daten.Geaendert = false;
            m_daten.Dateiname = behalten;
        }
        const std::optional<QString> gefunden = FindeDatei(m_pfad, name);
        if (!gefunden) {
            m_daten.Geaendert = m_daten.Geaendert || verworfen;
            MeldeDateiUngueltig();
            return;
        }
        m_daten.Dateiname = QDir::toNativeSeparators(m_pfad + trenner + *gefunden);
        if (!m_prozeduren.laden() && verworfen)
            m_daten.Geaendert = true;
    } else if (m_daten.DateiSpeichernUnter) {
        if (!brauchbarerName(name)) {
            MeldeDateiUngueltig();
            return;
        }
        m_daten.Dateiname = QDir::toNativeSeparators(m_pfad + trenner + name);
        m_daten.Geaendert = true;
        m_prozeduren.speichern(true);
    }
    close();
}
