#include "desktop/core/logo_fields.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "output/decoration.h"

#include <QGridLayout>
#include <QImage>
#include <QLabel>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::LogoOf;

namespace {

constexpr QSize picture_size{176, 72};
constexpr int picture_frame = 6;

struct LogoRow
{
    LogoOf whose;
    const char* name;
    const char* caption;
    const char* choose;
    const char* remove;
    const char* none;
};

constexpr std::array rows{
    LogoRow{LogoOf::all_churches, "all_churches", "For all churches", "&Choose…", "&Remove", "No logo"},
    LogoRow{LogoOf::workstation, "workstation", "For this workstation alone", "C&hoose…", "Remo&ve",
            "The logo of all churches"},
};

QString words_for(const core::GlobalVariables& variables, const LogoRow& row)
{
    const QString name = variables.logo_name(row.whose);
    if (name.isEmpty())
        return QString::fromLatin1(row.none);
    return variables.logo_missing(row.whose) ? u"%1 (no such picture)"_s.arg(name) : name;
}

QPushButton* make_button(const char* text, const QString& icon_name, const QString& name, const QString& spoken)
{
    auto* button = new QPushButton(icon(icon_name), QString::fromUtf8(text));
    button->setObjectName(name);
    button->setAccessibleName(spoken);
    return button;
}

} // namespace

LogoFields::LogoFields(QWidget* parent) : QWidget(parent), m_picture(make_picture()), m_logo(output::logo_room)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field);
    grid->setVerticalSpacing(space::field);
    grid->setColumnStretch(1, 1);
    for (const auto& row : rows) {
        const int place = static_cast<int>(row.whose);
        const QString name = QString::fromLatin1(row.name), caption = QString::fromLatin1(row.caption);
        auto* value = m_names[static_cast<std::size_t>(place)] = make_value();
        value->setObjectName(u"logo_of_"_s + name);
        auto* choose =
            make_button(row.choose, u"insert-image"_s, u"choose_logo_of_"_s + name, u"Choose the logo: "_s + caption);
        auto* remove =
            make_button(row.remove, u"edit-delete"_s, u"remove_logo_of_"_s + name, u"Remove the logo: "_s + caption);
        connect(choose, &QPushButton::clicked, this, [this, &row] { Q_EMIT choosing_wanted(row.whose); });
        connect(remove, &QPushButton::clicked, this, [this, &row] { Q_EMIT removal_wanted(row.whose); });
        grid->addWidget(new QLabel(caption), place, 0);
        grid->addWidget(value, place, 1);
        grid->addWidget(choose, place, 2);
        grid->addWidget(remove, place, 3);
    }
    grid->addWidget(m_picture, 0, 4, 2, 1);
}

QLabel* LogoFields::make_picture()
{
    auto* picture = new QLabel;
    picture->setObjectName(u"logo_picture"_s);
    picture->setFixedSize(picture_size);
    picture->setAlignment(Qt::AlignCenter);
    picture->setAutoFillBackground(true);
    QPalette paper = picture->palette();
    paper.setColor(QPalette::Window, Qt::white);
    paper.setColor(QPalette::WindowText, Qt::darkGray);
    picture->setPalette(paper);
    picture->setAccessibleName(u"The logo on reports"_s);
    return picture;
}

void LogoFields::show_logos(const core::GlobalVariables& variables)
{
    for (const auto& row : rows)
        m_names[static_cast<std::size_t>(row.whose)]->setText(words_for(variables, row));
    show_picture(variables.logo_in_use());
}

void LogoFields::show_picture(const QString& file)
{
    const auto image = m_logo.read(file).decoded();
    if (image.isNull()) {
        m_picture->setText(u"No picture"_s);
        return;
    }
    const QSize room = picture_size - QSize(picture_frame, picture_frame);
    const bool fits = image.width() <= room.width() && image.height() <= room.height();
    m_picture->setPixmap(
        QPixmap::fromImage(fits ? image : image.scaled(room, Qt::KeepAspectRatio, Qt::SmoothTransformation)));
}

bool is_picture(const QByteArray& content)
{
    return !pages::Picture::from_bytes(content, output::logo_room).empty();
}

} // namespace kindrel::desktop
