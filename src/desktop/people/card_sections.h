#pragma once

#include "desktop/people/card_list_view.h"
#include "desktop/people/card_text.h"
#include "desktop/shell/value_form.h"

#include <functional>

namespace kindrel::desktop {

/// The parts of the card that show one family or one person. A part whose section is closed says so instead.
template <class Of>
class CardSections
{
public:
    using Open = bool people::RecordAccess::*;

    [[nodiscard]] QWidget* add_form(const QString& title, std::span<const CardField<Of>> fields, Open open)
    {
        QStringList captions;
        for (const auto& field : fields)
            captions << QString::fromLatin1(field.caption);
        auto* form = new ValueForm(title, captions);
        add_part(
            open,
            [form, fields](const Of& of, const CardReader& reader) {
                for (std::size_t row = 0; row < fields.size(); ++row)
                    form->set(int(row), fields[row].value(of, reader), fields[row].hidden && fields[row].hidden(of));
            },
            [form, fields] {
                for (std::size_t row = 0; row < fields.size(); ++row)
                    form->set(int(row), row == 0 ? closed_words() : QString());
            });
        return form;
    }

    [[nodiscard]] QWidget* add_list(const CardList<Of>& list)
    {
        auto* view = new CardListView(QString::fromLatin1(list.title), list.columns);
        add_part(
            list.open,
            [view, rows = list.rows](const Of& of, const CardReader& reader) { view->show_rows(rows(of, reader)); },
            [view] { view->show_closed(); });
        return view;
    }

    void show(const Of& of, const people::RecordAccess& access, const CardReader& reader) const
    {
        for (const Part& part : m_parts)
            if (!part.open || access.*part.open)
                part.show(of, reader);
            else
                part.close();
    }

private:
    struct Part
    {
        Open open;
        std::function<void(const Of&, const CardReader&)> show;
        std::function<void()> close;
    };

    void add_part(Open open, std::function<void(const Of&, const CardReader&)> show, std::function<void()> close)
    {
        m_parts.push_back({open, std::move(show), std::move(close)});
    }

    std::vector<Part> m_parts;
};

} // namespace kindrel::desktop
