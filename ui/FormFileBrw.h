#pragma once

#include "data/DatenDatei.h"

#include <QDialog>
#include <QStringList>

#include <functional>
#include <optional>

struct InitMini;
class Meldungen;
class QComboBox;
class QFileSystemModel;
class QLabel;
class QLineEdit;
class QListView;
class QModelIndex;
class QPushButton;
class QTimer;
class QTreeView;

// The main window's Laden and Speichern with their window parts, which the browser runs on OK.
struct DateiProzeduren {
    std::function<bool()> laden;
    std::function<SpeicherErgebnis(bool speichernUnter)> speichern;
};

// The roots of the mounted drives; one entry ("/") where the system has no drive letters.
QStringList SystemLaufwerke();

// The first file of ordner matching name, which may be a pattern (* ? [...]), letter case
// ignored as on the systems the data files come from; nothing for a name the system cannot
// use as a file name in that folder.
std::optional<QString> FindeDatei(const QString &ordner, const QString &name);

// The program's own file dialog for "Datei öffnen" and "Datei speichern unter". The mode comes
// from DateiLaden / DateiSpeichernUnter; on OK the dialog sets Dateiname and runs Laden or
// Speichern itself.
class FormFileBrw : public QDialog
{
    Q_OBJECT
public:
    FormFileBrw(InitMini &daten, Meldungen &meldungen, DateiProzeduren prozeduren, const QString &programmOrdner,
                const QStringList &laufwerke = SystemLaufwerke(), QWidget *parent = nullptr);

    // The folder shown by the folder tree (DirList's path).
    QString pfad() const { return m_pfad; }
    // Opens a folder as a click in the folder tree does.
    void oeffneOrdner(const QString &ordner);

protected:
    void showEvent(QShowEvent *event) override;
    bool eventFilter(QObject *objekt, QEvent *event) override;

private:
    void FormActivate();
    void ChangePath();
    void MeldeDateiUngueltig();
    void CmdOK_Click();
    void DriveList_Change(int index);
    void DirList_Change(const QModelIndex &index);
    void FileList_Click(const QModelIndex &index);
    void FileList_PatternChange();
    void TxtDatei_Change(const QString &text);
    void CmbDateiFormat_Click(int index);
    void setzeMuster(const QString &muster);
    void waehleLaufwerk(int index);
    int laufwerkVon(const QString &ordner) const;

    InitMini &m_daten;
    Meldungen &m_meldungen;
    DateiProzeduren m_prozeduren;
    QString m_programmOrdner;
    QStringList m_laufwerke;
    QString m_pfad;
    QString m_muster;
    int m_letztesGutesLaufwerk = 0;
    bool m_aktiviert = false;

    QFileSystemModel *m_ordnerModell;
    QFileSystemModel *m_dateiModell;
    QLineEdit *m_txtDatei;
    QListView *m_fileList;
    QComboBox *m_cmbDateiFormat;
    QLabel *m_labVerzStruk;
    QTreeView *m_dirList;
    QLabel *m_labLaufwerk;
    QComboBox *m_driveList;
    QPushButton *m_cmdOK;
    QPushButton *m_cmdAbbruch;
    QTimer *m_nachfuehren;
};
