// SPDX-License-Identifier: MIT
#pragma once

#include "focusedfield.h"
#include "keylayout.h"
#include "typedtext.h"
#include "writtentext.h"

#include <QObject>
#include <QQuickItem>
#include <QVariantList>
#include <QVector>

class DrivingLock;
class Language;

/// \brief The on-screen keyboard and writing pad: a popup for as long as a text field has the focus. GUI thread only.
///
/// Which keys it has first says the language's property "keyboard"; the Latin ones are always at hand. Nothing that is
/// typed or drawn is logged.
class InputPanel : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool open READ isOpen NOTIFY openChanged)
    Q_PROPERTY(bool writing READ isWriting NOTIFY layoutChanged)
    Q_PROPERTY(bool canWrite READ canWrite NOTIFY layoutChanged)
    Q_PROPERTY(bool hasOtherLayouts READ hasOtherLayouts NOTIFY layoutChanged)
    Q_PROPERTY(QString layout READ layout NOTIFY layoutChanged)
    Q_PROPERTY(QString lettersTitle READ lettersTitle NOTIFY layoutChanged)
    Q_PROPERTY(QVariantList rows READ rows NOTIFY layoutChanged)
    Q_PROPERTY(QVariantList padKeys READ padKeys NOTIFY layoutChanged)
    Q_PROPERTY(int shift READ shift NOTIFY shiftChanged)
    Q_PROPERTY(QStringList candidates READ candidates NOTIFY candidatesChanged)
    Q_PROPERTY(int boxes READ boxes NOTIFY padChanged)
    Q_PROPERTY(double height READ height WRITE setHeight NOTIFY heightChanged)
    Q_PROPERTY(double lift READ lift NOTIFY heightChanged)
    Q_PROPERTY(QQuickItem* viewLayer READ viewLayer WRITE setViewLayer NOTIFY viewLayerChanged)

public:
    enum Shift { Small, CapitalOnce, Capitals };
    Q_ENUM(Shift)

    /// \brief In a \a language, and not while the driver has to look at the road; both outlive it.
    InputPanel(const Language& language, const DrivingLock& lock, QObject* parent);

    bool isOpen() const { return m_field.exists(); }
    bool isWriting() const { return m_writing; }
    bool canWrite() const { return m_layout->handwriting && !isNumeric(); } ///< the language can be written by hand
    bool hasOtherLayouts() const;
    QString layout() const { return m_layout->name; }
    QString lettersTitle() const { return m_letters->title; } ///< of the layout to come back to from the symbols
    QVariantList rows() const;                                ///< of keys; see KeyLayout
    QVariantList padKeys() const;                             ///< those beside the writing pad
    int shift() const { return m_shift; }
    QStringList candidates() const { return composer().candidates(); }
    int boxes() const { return m_written.boxes(); } ///< of the writing pad, side by side
    double height() const { return m_height; }      ///< pixels of the window that it covers, as the popup says
    double lift() const; ///< pixels by which the view has to move up, so that the field is in sight

    QQuickItem* viewLayer() const { return m_viewLayer; } ///< what moves up
    void setViewLayer(QQuickItem* layer);
    void setHeight(double height);

    Q_INVOKABLE void type(const QString& text);       ///< a key that types was pressed
    Q_INVOKABLE void press(const QString& action);    ///< a key that does something was pressed; see KeyLayout
    Q_INVOKABLE void offer(const QStringList& texts); ///< shows further texts of a key as candidates
    Q_INVOKABLE void select(int candidate);
    Q_INVOKABLE void setPadSize(double width, double height);
    Q_INVOKABLE void beginStroke(double x);
    Q_INVOKABLE void addStroke(const QVariantList& points);

    void useNextLayout(); ///< as the key for it does

Q_SIGNALS:
    void openChanged();
    void layoutChanged();
    void shiftChanged();
    void candidatesChanged();
    void heightChanged();
    void viewLayerChanged();
    void padChanged();
    void padCleared(); ///< what is drawn is done with
    void handRested(); ///< what is drawn is taken for a whole character

private:
    void readLayouts();
    const KeyLayout* find(const QString& name) const;
    bool isNumeric() const;
    TextComposer& composer();
    const TextComposer& composer() const;
    void connectComposer(TextComposer* composer);
    void followField();
    void offerLayouts();
    void useLayout(const KeyLayout* layout);
    void setWriting(bool writing);
    void setShift(Shift shift);
    void shiftAsTheTextWants();
    void toggleShift();
    void space();
    void takeBack();
    void enter();
    void hide();

    const Language& m_language;
    QVector<KeyLayout> m_layouts;
    QStringList m_offered; ///< names, the first for the language
    const KeyLayout* m_layout = nullptr;
    const KeyLayout* m_letters = nullptr; ///< to come back to from the symbols
    FocusedField m_field;
    TypedText m_typed;
    WrittenText m_written;
    bool m_writing = false;
    Shift m_shift = Small;
    double m_height = 0;
    QPointer<QQuickItem> m_viewLayer; ///< what moves up
};
