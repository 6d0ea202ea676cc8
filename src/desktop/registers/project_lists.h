#pragma once

#include "desktop/shell/ordered_list_model.h"
#include "registers/project_setup.h"

namespace kindrel::desktop {

/// The projects of a register for the ordered-list editor.
class ProjectOperations : public ListOperations
{
public:
    /// Works on whatever stands in `setup`, which may be replaced.
    ProjectOperations(const std::unique_ptr<registers::ProjectSetup>& setup, registers::Kind kind)
        : m_setup(setup), m_kind(kind)
    {
    }

    [[nodiscard]] ListCaptions captions() const override { return {.fields = {QStringLiteral("Project")}}; }
    [[nodiscard]] int count() const override { return m_setup->list(m_kind).size(); }
    [[nodiscard]] ListRow row(int index) const override { return {.texts = {m_setup->list(m_kind)[index].name}}; }
    [[nodiscard]] QString count_line() const override;
    [[nodiscard]] bool add(const QStringList& texts) override { return m_setup->add(m_kind, texts.value(0)); }
    [[nodiscard]] bool rename(int index, const QStringList& texts) override
    {
        return m_setup->rename(m_kind, index, texts.value(0));
    }
    [[nodiscard]] bool remove(int index) override { return m_setup->remove(m_kind, index); }
    [[nodiscard]] bool move_up(int index) override { return m_setup->move_up(m_kind, index); }
    [[nodiscard]] bool move_down(int index) override { return m_setup->move_down(m_kind, index); }
    [[nodiscard]] bool has_tools() const override { return false; }

private:
    const std::unique_ptr<registers::ProjectSetup>& m_setup;
    registers::Kind m_kind;
};

/// One kind of categories of the weekly project that is chosen at the moment.
class CategoryOperations : public ListOperations
{
public:
    CategoryOperations(const std::unique_ptr<registers::ProjectSetup>& setup, registers::FigureKind kind,
                       const int& project)
        : m_setup(setup), m_kind(kind), m_project(project)
    {
    }

    [[nodiscard]] ListCaptions captions() const override { return {.fields = {QStringLiteral("Category")}}; }
    [[nodiscard]] int count() const override { return int(items().size()); }
    [[nodiscard]] ListRow row(int index) const override { return {.texts = {items()[std::size_t(index)].name}}; }
    [[nodiscard]] QString count_line() const override;
    [[nodiscard]] bool add(const QStringList& texts) override
    {
        return m_setup->add_category(m_project, m_kind, texts.value(0));
    }
    [[nodiscard]] bool rename(int index, const QStringList& texts) override
    {
        return m_setup->rename_category(m_project, m_kind, index, texts.value(0));
    }
    [[nodiscard]] bool remove(int index) override { return m_setup->remove_category(m_project, m_kind, index); }
    [[nodiscard]] bool move_up(int index) override { return m_setup->move_category_up(m_project, m_kind, index); }
    [[nodiscard]] bool move_down(int index) override { return m_setup->move_category_down(m_project, m_kind, index); }
    [[nodiscard]] bool has_tools() const override { return false; }

private:
    /// None without a project.
    [[nodiscard]] const std::vector<registers::CategoryItem>& items() const;

    const std::unique_ptr<registers::ProjectSetup>& m_setup;
    registers::FigureKind m_kind;
    const int& m_project;
};

} // namespace kindrel::desktop
