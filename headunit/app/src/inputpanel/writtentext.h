// SPDX-License-Identifier: MIT
#pragma once

#include "textcomposer.h"

#include <HmiCore/HmiHandwriting>

#include <QPointer>
#include <QTimer>

/// \brief Texts that are written by hand, a character at a time.
///
/// The pad is a row of boxes, about as wide as high, for a character each: engines expect one that fills its area. Strokes go to the
/// recognizer as they end, which is asked for candidates once more when the hand rests. A stroke that begins in another box belongs to
/// the next character, and so does one that comes after a rest if the letters are Latin: the first candidate is taken then.
class WrittenText : public TextComposer
{
    Q_OBJECT

public:
    explicit WrittenText(QObject* parent);

    void setLanguage(int language); ///< of HmiHandwriting
    /// \brief Whether there is an engine for the language. It is made for that.
    bool canWrite();
    void setPadSize(double width, double height); ///< of the whole row, in pixels
    int boxes() const { return m_boxes; }         ///< how many there are

    void beginStroke(double x);                 ///< the pen comes down, so far from the left edge of the pad
    void addStroke(const QVariantList& points); ///< a list of QPointF, in pixels of the pad

    void select(int candidate) override;
    bool takeBack() override;
    void finish() override;
    void drop() override;

Q_SIGNALS:
    void padCleared(); ///< what is drawn is done with
    void handRested(); ///< what is drawn is taken for a whole character

private:
    void follow();
    void rest();
    void present(const QStringList& candidates);
    void clear();

    HmiCore::HmiHandwriting m_handwriting;
    QPointer<HmiCore::HmiHandwritingRecognizer> m_recognizer;
    QTimer m_pause;
    double m_boxWidth = 0;
    double m_height = 0;
    int m_boxes = 1;
    int m_box = 0; ///< in which is written, from the left
    bool m_rested = false;
    bool m_isBegun = false; ///< strokes were drawn that are not decided on
    bool m_isStale = false; ///< candidates that still arrive are of strokes that are gone
};
