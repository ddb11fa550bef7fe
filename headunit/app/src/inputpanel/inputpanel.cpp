// SPDX-License-Identifier: MIT
#include "inputpanel.h"

#include "drivinglock.h"
#include "language.h"

#include <HmiGuiFramework/AppSettings>

#include <QDir>
#include <QLoggingCategory>
#include <QQuickWindow>

#include <algorithm>
#include <iterator>

using HmiGuiFramework::AppSettings;

namespace {

Q_LOGGING_CATEGORY(inputLog, "headunit.inputpanel")

const QString latin = QStringLiteral("Latin");
const QString symbols = QStringLiteral("Symbols");
const QString numbers = QStringLiteral("Numbers");
const QString pad = QStringLiteral("Pad");

struct Action
{
    const char* name;
    void (*perform)(InputPanel& panel);
};

} // namespace

InputPanel::InputPanel(const Language& language, const DrivingLock& lock, QObject* parent)
    : QObject(parent)
    , m_language(language)
    , m_field(this)
    , m_typed(this)
    , m_written(this)
{
    readLayouts();
    m_layout = m_letters = find(latin);
    connectComposer(&m_typed);
    connectComposer(&m_written);
    connect(&m_written, &WrittenText::padCleared, this, &InputPanel::padCleared);
    connect(&m_written, &WrittenText::handRested, this, &InputPanel::handRested);
    connect(&m_field, &FocusedField::changed, this, &InputPanel::followField);
    connect(&m_language, &Language::changed, this, &InputPanel::offerLayouts);
    connect(&lock, &DrivingLock::lockedChanged, this, [this, &lock] {
        if (lock.isLocked())
            hide();
    });
    offerLayouts();
}

void InputPanel::readLayouts()
{
    const QDir folder(QStringLiteral(":/app/layouts"));
    const QStringList files = folder.entryList();
    for (const QString& file : files) {
        QString error;
        const std::optional<KeyLayout> layout = KeyLayout::read(folder.filePath(file), &error);
        if (layout)
            m_layouts.append(*layout);
        else
            qCCritical(inputLog).noquote() << "Keyboard layout left out," << error;
    }
}

const KeyLayout* InputPanel::find(const QString& name) const
{
    const auto found = std::find_if(m_layouts.cbegin(), m_layouts.cend(),
                                    [&name](const KeyLayout& layout) { return layout.name == name; });
    return found == m_layouts.cend() ? nullptr : &*found;
}

void InputPanel::connectComposer(TextComposer* composer)
{
    connect(composer, &TextComposer::changed, this, [this, composer] {
        if (composer != &this->composer())
            return;
        m_field.setPreliminary(composer->preliminary());
        Q_EMIT candidatesChanged();
    });
    connect(composer, &TextComposer::committed, this, [this](const QString& text) {
        m_field.commit(text);
        shiftAsTheTextWants();
    });
}

TextComposer& InputPanel::composer()
{
    return m_writing ? static_cast<TextComposer&>(m_written) : m_typed;
}

const TextComposer& InputPanel::composer() const
{
    return m_writing ? static_cast<const TextComposer&>(m_written) : m_typed;
}

bool InputPanel::isNumeric() const
{
    return m_field.hints() & (Qt::ImhDigitsOnly | Qt::ImhDialableCharactersOnly | Qt::ImhFormattedNumbersOnly);
}

bool InputPanel::hasOtherLayouts() const
{
    return m_offered.size() > 1;
}

QVariantList InputPanel::rows() const
{
    return m_layout->rows(AppSettings::instance()->rightToLeft());
}

QVariantList InputPanel::padKeys() const
{
    return find(pad)->rows(false).constFirst().toList();
}

/// What was begun for another field is not for this one.
void InputPanel::followField()
{
    m_typed.drop();
    m_written.drop();
    if (isOpen()) {
        useLayout(isNumeric() ? find(numbers) : m_letters);
    }
    Q_EMIT openChanged();
    Q_EMIT heightChanged();
}

void InputPanel::offerLayouts()
{
    m_offered.clear();
    const QString wanted = m_language.keyboard();
    if (find(wanted))
        m_offered.append(wanted);
    else
        qCWarning(inputLog) << "There is no keyboard layout" << wanted;
    if (!wanted.startsWith(latin))
        m_offered.append(latin);
    m_letters = find(m_offered.constFirst());
    useLayout(m_letters);
}

void InputPanel::useLayout(const KeyLayout* layout)
{
    composer().finish();
    m_layout = layout;
    if (m_layout->name != symbols && m_layout->name != numbers)
        m_letters = layout;
    m_typed.setLanguage(layout->engine);
    if (m_writing)
        setWriting(canWrite());
    shiftAsTheTextWants();
    Q_EMIT layoutChanged();
    Q_EMIT candidatesChanged();
}

void InputPanel::useNextLayout()
{
    const auto next = (m_offered.indexOf(m_letters->name) + 1) % m_offered.size();
    useLayout(find(m_offered.at(next)));
}

void InputPanel::setWriting(bool writing)
{
    composer().finish();
    m_writing = writing;
    if (writing)
        m_written.setLanguage(m_layout->handwriting);
    Q_EMIT layoutChanged();
    Q_EMIT candidatesChanged();
}

void InputPanel::setShift(Shift shift)
{
    if (shift == m_shift)
        return;
    m_shift = shift;
    Q_EMIT shiftChanged();
}

void InputPanel::toggleShift()
{
    setShift(m_shift == Small ? CapitalOnce : m_shift == CapitalOnce ? Capitals : Small);
}

/// A capital at the beginning of a text and of a sentence, where the field does not mind.
void InputPanel::shiftAsTheTextWants()
{
    if (m_shift == Capitals)
        return;
    const QString before = m_field.textBeforeCursor().trimmed();
    const bool begins = before.isEmpty() || (before.endsWith(QLatin1Char('.')) && m_field.textBeforeCursor() != before);
    const bool wanted =
        begins && !m_layout->engine && !(m_field.hints() & (Qt::ImhNoAutoUppercase | Qt::ImhPreferLowercase));
    setShift(wanted ? CapitalOnce : Small);
}

void InputPanel::type(const QString& text)
{
    if (m_writing)
        m_written.finish();
    m_typed.type(text);
}

void InputPanel::press(const QString& name)
{
    static const Action actions[] = {
        {"shift", [](InputPanel& panel) { panel.toggleShift(); }},
        {"backspace", [](InputPanel& panel) { panel.takeBack(); }},
        {"space", [](InputPanel& panel) { panel.space(); }},
        {"enter", [](InputPanel& panel) { panel.enter(); }},
        {"symbols", [](InputPanel& panel) { panel.useLayout(panel.find(symbols)); }},
        {"letters", [](InputPanel& panel) { panel.useLayout(panel.m_letters); }},
        {"layout", [](InputPanel& panel) { panel.useNextLayout(); }},
        {"writing", [](InputPanel& panel) { panel.setWriting(panel.canWrite()); }},
        {"keys", [](InputPanel& panel) { panel.setWriting(false); }},
        {"hide", [](InputPanel& panel) { panel.hide(); }},
    };
    const auto* const action = std::find_if(std::begin(actions), std::end(actions), [&name](const auto& candidate) {
        return name == QLatin1String(candidate.name);
    });
    if (action != std::end(actions))
        action->perform(*this);
}

void InputPanel::space()
{
    if (m_writing)
        m_written.finish();
    m_typed.space();
}

void InputPanel::takeBack()
{
    if (composer().takeBack())
        return;
    m_field.press(Qt::Key_Backspace);
    shiftAsTheTextWants();
}

/// What is begun is taken as it is; only then is the text done.
void InputPanel::enter()
{
    if (m_writing)
        m_written.finish();
    else if (!m_typed.preliminary().isEmpty())
        return m_typed.commitLetters();
    m_field.press(Qt::Key_Return);
}

void InputPanel::hide()
{
    composer().finish();
    m_field.leave();
}

void InputPanel::offer(const QStringList& texts)
{
    if (!m_writing)
        m_typed.offer(texts);
}

void InputPanel::select(int candidate)
{
    composer().select(candidate);
}

void InputPanel::setPadSize(double width, double height)
{
    m_written.setPadSize(width, height);
    Q_EMIT padChanged();
}

void InputPanel::beginStroke(double x)
{
    m_written.beginStroke(x);
}

void InputPanel::addStroke(const QVariantList& points)
{
    m_written.addStroke(points);
}

void InputPanel::setViewLayer(QQuickItem* layer)
{
    if (layer == m_viewLayer)
        return;
    m_viewLayer = layer;
    Q_EMIT viewLayerChanged();
}

void InputPanel::setHeight(double height)
{
    if (height == m_height)
        return;
    m_height = height;
    Q_EMIT heightChanged();
}

double InputPanel::lift() const
{
    const double bottom = m_field.bottomOn(m_viewLayer);
    return bottom > 0 ? std::max(0.0, m_viewLayer->y() + bottom + m_height - m_viewLayer->window()->height()) : 0;
}
