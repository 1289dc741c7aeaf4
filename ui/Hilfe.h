#pragma once

#include <QPointer>
#include <QString>
#include <QTextBrowser>

// The help viewer: the help file "pradilon.hlp" opened at its contents or at the page on using
// the help viewer.
class Hilfe
{
public:
    virtual ~Hilfe() = default;
    virtual void setzeDatei(const QString &pfad) = 0;
    virtual QString datei() const = 0;
    virtual void ZeigeInhalt() = 0;
    virtual void ZeigeHilfeZurHilfe() = 0;
};

// The program's folder joined with "pradilon.hlp" by exactly one separator.
QString HilfeDateiPfad(const QString &programmOrdner);

// The help file is HTML; its two entry points are the anchors "inhalt" and "hilfe-zur-hilfe".
// The window is a top-level window of its own, so it stays usable while the main window is
// disabled by a secondary window.
class HilfeFenster : public Hilfe
{
public:
    HilfeFenster() = default;
    ~HilfeFenster() override;
    HilfeFenster(const HilfeFenster &) = delete;
    HilfeFenster &operator=(const HilfeFenster &) = delete;

    void setzeDatei(const QString &pfad) override { m_datei = pfad; }
    QString datei() const override { return m_datei; }
    void ZeigeInhalt() override;
    void ZeigeHilfeZurHilfe() override;

    // The window once it has been shown (for tests); null before.
    QWidget *fenster() const { return m_fenster; }
    QTextBrowser *browser() const { return m_browser; }

private:
    void zeige(const QString &anker);
    void baueFenster();

    QString m_datei;
    QPointer<QWidget> m_fenster;
    QPointer<QTextBrowser> m_browser;
};
