#include "ui/Hilfe.h"

#include <QFileInfo>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QPushButton>
#include <QScreen>
#include <QTextBrowser>
#include <QUrl>
#include <QVBoxLayout>
#include <QWidget>

QString HilfeDateiPfad(const QString &programmOrdner)
{
    QString pfad = programmOrdner;
    if (!pfad.endsWith(QLatin1Char('/')) && !pfad.endsWith(QLatin1Char('\\')))
        pfad += QLatin1Char('/');
    return pfad + QStringLiteral("pradilon.hlp");
}

HilfeFenster::~HilfeFenster()
{
    delete m_fenster;
}

void HilfeFenster::ZeigeInhalt()
{
    zeige(QStringLiteral("inhalt"));
}

void HilfeFenster::ZeigeHilfeZurHilfe()
{
    zeige(QStringLiteral("hilfe-zur-hilfe"));
}

void HilfeFenster::baueFenster()
{
    m_fenster = new QWidget;
    m_fenster->setObjectName(QStringLiteral("HilfeFenster"));
    m_fenster->setWindowTitle(QStringLiteral("Pradilon-Hilfe"));

    m_browser = new QTextBrowser(m_fenster);
    m_browser->setObjectName(QStringLiteral("HilfeBrowser"));
    m_browser->setOpenExternalLinks(false);

    auto *inhalt = new QPushButton(QStringLiteral("&Inhalt"), m_fenster);
    auto *zurueck = new QPushButton(QStringLiteral("&Zurück"), m_fenster);
    auto *vor = new QPushButton(QStringLiteral("&Vorwärts"), m_fenster);
    auto *hilfeZurHilfe = new QPushButton(QStringLiteral("&Hilfe zur Hilfe"), m_fenster);
    auto *schliessen = new QPushButton(QStringLiteral("&Schließen"), m_fenster);
    inhalt->setObjectName(QStringLiteral("BtnHilfeInhalt"));
    zurueck->setObjectName(QStringLiteral("BtnHilfeZurueck"));
    vor->setObjectName(QStringLiteral("BtnHilfeVor"));
    hilfeZurHilfe->setObjectName(QStringLiteral("BtnHilfeZurHilfe"));
    schliessen->setObjectName(QStringLiteral("BtnHilfeSchliessen"));
    zurueck->setEnabled(false);
    vor->setEnabled(false);

    QObject::connect(inhalt, &QPushButton::clicked, m_fenster, [this] { ZeigeInhalt(); });
    QObject::connect(hilfeZurHilfe, &QPushButton::clicked, m_fenster, [this] { ZeigeHilfeZurHilfe(); });
    QObject::connect(zurueck, &QPushButton::clicked, m_browser, &QTextBrowser::backward);
    QObject::connect(vor, &QPushButton::clicked, m_browser, &QTextBrowser::forward);
    QObject::connect(m_browser, &QTextBrowser::backwardAvailable, zurueck, &QPushButton::setEnabled);
    QObject::connect(m_browser, &QTextBrowser::forwardAvailable, vor, &QPushButton::setEnabled);
    QObject::connect(schliessen, &QPushButton::clicked, m_fenster, &QWidget::close);

    auto *knoepfe = new QHBoxLayout;
    for (QPushButton *k : {inhalt, zurueck, vor, hilfeZurHilfe})
        knoepfe->addWidget(k);
    knoepfe->addStretch();
    knoepfe->addWidget(schliessen);
    auto *layout = new QVBoxLayout(m_fenster);
    layout->addLayout(knoepfe);
    layout->addWidget(m_browser);
    m_fenster->resize(640, 560);
    if (QScreen *bildschirm = QGuiApplication::primaryScreen()) {
        const QRect f = bildschirm->availableGeometry();
        m_fenster->move(f.x() + (f.width() - m_fenster->width()) / 2, f.y() + (f.height() - m_fenster->height()) / 2);
    }
}

void HilfeFenster::zeige(const QString &anker)
{
    if (!m_fenster)
        baueFenster();

    // A missing file is reported by the viewer itself, as a page, not by the program.
    if (!QFileInfo(m_datei).isFile()) {
        m_browser->setHtml(QStringLiteral("<h2>Hilfe nicht verfügbar</h2><p>Die Hilfedatei „%1“ wurde nicht "
                                          "gefunden.</p>")
                               .arg(m_datei.toHtmlEscaped()));
    } else {
        QUrl url = QUrl::fromLocalFile(m_datei);
        url.setFragment(anker);
        // The extension .hlp tells Qt nothing, so the type is given.
        m_browser->setSource(url, QTextDocument::HtmlResource);
    }
    m_fenster->show();
    m_fenster->raise();
    m_fenster->activateWindow();
}
