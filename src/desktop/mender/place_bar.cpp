#include "desktop/mender/place_bar.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int church_letters = 22;

QLabel* make_caption(const QString& text, QWidget* field)
{
    auto* caption = new QLabel(text);
    caption->setBuddy(field);
    return caption;
}

} // namespace

PlaceBar::PlaceBar()
    : m_drive(new QLineEdit), m_browse(new QPushButton(icon(u"document-open-folder"_s), u"&Browse…"_s)),
      m_church(new QComboBox), m_check(new QPushButton(icon(u"edit-find"_s), u"Chec&k"_s))
{
    m_drive->setObjectName(u"data_drive"_s);
    m_drive->setToolTip(u"The folder in which '%1' lies"_s.arg(core::data_folder));
    m_browse->setObjectName(u"browse"_s);
    m_church->setObjectName(u"church"_s);
    m_church->setPlaceholderText(u"Choose a church"_s);
    m_church->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_church->setMinimumContentsLength(church_letters);
    m_check->setObjectName(u"check"_s);
    m_check->setToolTip(u"Looks for everything that may be wrong and changes nothing (F5)"_s);
    for (auto* button : {m_browse, m_check})
        button->setAutoDefault(true); // Enter presses it.
    connect(m_drive, &QLineEdit::editingFinished, this, &PlaceBar::settle_drive);
    connect(m_browse, &QPushButton::clicked, this, &PlaceBar::browse_wanted);
    connect(m_church, &QComboBox::currentIndexChanged, this, &PlaceBar::church_chosen);
    connect(m_check, &QPushButton::clicked, this, &PlaceBar::check_wanted);

    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(make_caption(u"&Data drive"_s, m_drive));
    row->addWidget(m_drive, 1);
    row->addWidget(m_browse);
    row->addSpacing(space::field);
    row->addWidget(make_caption(u"&Church"_s, m_church));
    row->addWidget(m_church);
    row->addWidget(m_check);
}

void PlaceBar::show_list(const ChurchList& list)
{
    const QSignalBlocker quiet(m_church);
    m_list = list;
    m_drive->setText(list.data_drive);
    m_drive->setCursorPosition(0);
    m_church->clear();
    for (const auto& church : list.churches)
        m_church->addItem(church.present ? church.name : church.name + u" (no records)"_s, church.number);
    m_church->setCurrentIndex(m_church->findData(list.chosen));
}

QString PlaceBar::data_drive() const
{
    return m_drive->text().trimmed();
}

int PlaceBar::church() const
{
    return m_church->currentData().toInt();
}

QString PlaceBar::church_in_words() const
{
    const auto found = std::ranges::find(m_list.churches, church(), &ListedChurch::number);
    return found == m_list.churches.end() ? QString() : found->name;
}

void PlaceBar::lead_to_check()
{
    QWidget* target = church() > 0 ? static_cast<QWidget*>(m_check) : m_church;
    target->setFocus(Qt::OtherFocusReason);
}

void PlaceBar::lead_to_drive()
{
    m_drive->setFocus(Qt::OtherFocusReason);
    m_drive->selectAll();
}

bool PlaceBar::settle_drive()
{
    if (data_drive() == m_list.data_drive)
        return false;
    Q_EMIT drive_chosen();
    return true;
}

} // namespace kindrel::desktop
