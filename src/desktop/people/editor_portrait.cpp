#include "desktop/people/editor_portrait.h"

#include "core/files.h"
#include "desktop/people/portrait.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/person_files.h"

#include <QBuffer>
#include <QFileInfo>
#include <QImageReader>
#include <QPainter>
#include <QPushButton>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int greatest_side = 1200;
constexpr int jpeg_quality = 90;

QSize fitting(const QSize& size)
{
    const bool fits = std::max(size.width(), size.height()) <= greatest_side;
    return fits ? size : size.scaled(greatest_side, greatest_side, Qt::KeepAspectRatio);
}

/// Upright, and no larger than a photograph is ever shown or printed; null for a file that is no picture.
QImage read_photograph(const QString& file)
{
    QImageReader reader(file);
    reader.setDecideFormatFromContent(true);
    reader.setAutoTransform(true);
    // Made small while it is decoded: a picture from a camera would take hundreds of megabytes otherwise.
    if (const QSize size = reader.size(); size.isValid())
        reader.setScaledSize(fitting(size));
    const QImage picture = reader.read();
    return picture.isNull() ? picture
                            : picture.scaled(fitting(picture.size()), Qt::KeepAspectRatio, Qt::SmoothTransformation);
}

/// What is transparent becomes white.
QByteArray jpeg_of(const QImage& picture)
{
    QImage paper(picture.size(), QImage::Format_RGB32);
    paper.fill(Qt::white);
    QPainter(&paper).drawImage(0, 0, picture);
    QByteArray content;
    QBuffer buffer(&content);
    paper.save(&buffer, "JPG", jpeg_quality);
    return content;
}

} // namespace

EditorPortrait::EditorPortrait(EditorBench& bench, QWidget* parent)
    : QWidget(parent), m_bench(bench), m_portrait(new Portrait),
      m_add(new QPushButton(icon(u"insert-image"_s), u"Add p&hotograph\u2026"_s)),
      m_remove(new QPushButton(icon(u"edit-delete"_s), u"Remove"_s))
{
    m_add->setObjectName(u"add_photograph"_s);
    m_remove->setObjectName(u"remove_photograph"_s);
    m_remove->setAccessibleName(u"Remove the photograph"_s);
    connect(m_add, &QPushButton::clicked, this, &EditorPortrait::add);
    connect(m_remove, &QPushButton::clicked, this, &EditorPortrait::remove);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addWidget(m_portrait, 0, Qt::AlignHCenter);
    column->addSpacing(space::field / 2);
    column->addWidget(m_add);
    column->addWidget(m_remove);
    column->addStretch(1);
    show_file();
}

const people::Person* EditorPortrait::person() const
{
    const auto& people = m_bench.editor.file().people;
    const int place = m_bench.person();
    return place < 0 || place >= std::ssize(people) ? nullptr : &people[std::size_t(place)];
}

void EditorPortrait::show_file()
{
    const auto photograph = people::portrait_of_person(person() ? person()->person_id : 0); // Nobody has key 0.
    m_portrait->show_file(m_bench.desk.office.paths.file(photograph.folder, photograph.name));
    const bool may_edit = m_bench.editor.may_edit();
    m_add->setVisible(may_edit);
    m_add->setText(m_portrait->empty() ? u"Add p&hotograph\u2026"_s : u"Change p&hotograph\u2026"_s);
    m_remove->setVisible(may_edit && !m_portrait->empty());
}

void EditorPortrait::add()
{
    const bool opened = m_bench.editor.may_open_portrait();
    m_bench.show_again(); // The family may have been saved on the way.
    auto& dialogue = m_bench.desk.office.dialogue;
    if (!opened || !person())
        return;
    const auto file = dialogue.choose_file({.title = u"Photograph of %1"_s.arg(person()->Name),
                                            .filter = u"Pictures (*.jpg *.jpeg *.png *.bmp *.gif)"_s,
                                            .suggested = {}});
    if (!file)
        return;
    const QImage picture = read_photograph(*file);
    if (picture.isNull())
        dialogue.show({u"%1 is not a picture that can be read"_s.arg(QFileInfo(*file).fileName()),
                       u"A photograph is a JPEG, PNG, BMP or GIF file."_s});
    else
        store(jpeg_of(picture));
}

void EditorPortrait::remove()
{
    if (!person())
        return;
    const core::Message question{.text = u"Do you wish to remove the photograph of %1?"_s.arg(person()->Name),
                                 .icon = core::Icon::question};
    if (m_bench.desk.office.dialogue.confirm(question, core::Answer::no))
        store(std::nullopt);
}

bool EditorPortrait::store(const std::optional<QByteArray>& jpeg)
{
    auto& office = m_bench.desk.office;
    try {
        people::set_portrait(office.paths, people::portrait_of_person(person()->person_id), jpeg);
    } catch (const core::FileError& error) {
        office.dialogue.show({u"Unable to store the photograph"_s, error.text()});
        return false;
    }
    show_file();
    return true;
}

} // namespace kindrel::desktop
