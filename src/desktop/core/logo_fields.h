#pragma once

#include "core/global_variables.h"
#include "desktop/output/head_picture.h"

#include <QWidget>

class QLabel;

namespace kindrel::desktop {

/// The logo of all churches and that of this workstation, with the picture that reports bear.
class LogoFields : public QWidget
{
    Q_OBJECT

public:
    explicit LogoFields(QWidget* parent = nullptr);

    void show_logos(const core::GlobalVariables& variables);

Q_SIGNALS:
    void choosing_wanted(core::LogoOf whose);
    void removal_wanted(core::LogoOf whose);

private:
    [[nodiscard]] QLabel* make_picture();
    void show_picture(const QString& file);

    std::array<QLabel*, 2> m_names{};
    QLabel* m_picture;
    PictureFile m_logo;
};

/// Whether reports can show a file of this content.
[[nodiscard]] bool is_picture(const QByteArray& content);

} // namespace kindrel::desktop
