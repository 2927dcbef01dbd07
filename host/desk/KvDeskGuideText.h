// SPDX-License-Identifier: MIT
#pragma once

#include <QTextBrowser>
#include <QVector>

/**
 * A Markdown text with pictures to read: headings are anchors, links to them and showHeading() go there, and
 * backward() goes back. Other links are opened by the desktop.
 *
 * Paragraphs, lists and tables read as the language of the text does, which the name of the file says
 * ("guide.Arabic.md"), whatever that of the program is; code reads from left to right.
 */
class KvDeskGuideText : public QTextBrowser
{
    Q_OBJECT
public:
    struct Heading
    {
        QString title;
        QString anchor; ///< what comes behind "#" in links; unique
        int level = 1;
        int position = 0; ///< in the document
    };

    /** A text that cannot be read is empty; \a path is that of a UTF-8 file. */
    explicit KvDeskGuideText(const QString &path, QWidget *parent = nullptr);

    /** What a heading is called in links: letters and digits in lower case, hyphens for spaces. */
    static QString anchorOf(const QString &title);

    const QVector<Heading> &headings() const { return m_headings; }
    /** Index of the heading of what is at the top of the view; -1 above the first. */
    int headingInView() const;
    void showHeading(int index);

    /** Selects the next place of a text, or the one before the selection, beginning anew at the other end.
     * False where there is none. */
    bool findNext(const QString &text);
    bool findPrevious(const QString &text);
    /** The same from the start of the selection on, for a text that is being typed. */
    bool findTyped(const QString &text);

    /** Size of the letters in percent of the program's. */
    int zoom() const { return m_zoom; }
    void setZoom(int percent);

public slots:
    void slotZoomIn();
    void slotZoomOut();
    void slotZoomNormal();

signals:
    void signalHeadingInViewChanged(int aIndex);

protected:
    void wheelEvent(QWheelEvent *event) override;
    /** Without the marks around code and at bullets, which are for the eye only. */
    QMimeData *createMimeDataFromSelection() const override;

private slots:
    void slotOpenLink(const QUrl &aUrl);
    void slotColourText();
    void slotScrolled();

private:
    void load(const QString &path);
    void setDirection(Qt::LayoutDirection direction);
    void isolateCode();
    void nameHeadings();
    void spaceBlocks();
    void colourTables();
    bool select(const QString &text, const QTextCursor &from, QTextDocument::FindFlags flags);

    QString m_folder;
    QVector<Heading> m_headings;
    int m_zoom = 100;
};
