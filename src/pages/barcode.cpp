#include "pages/barcode.h"

#include <zint.h>

#include <memory>
#include <stdexcept>

namespace kindrel::pages {

namespace {

using Symbol = std::unique_ptr<zint_symbol, decltype(&ZBarcode_Delete)>;

Symbol encoded(const QString& content)
{
    Symbol symbol(ZBarcode_Create(), &ZBarcode_Delete);
    symbol->symbology = BARCODE_CODE128;
    const auto bytes = content.toUtf8();
    const auto result =
        ZBarcode_Encode(symbol.get(), reinterpret_cast<const unsigned char*>(bytes.constData()), int(bytes.size()));
    if (result >= ZINT_ERROR)
        throw std::invalid_argument(symbol->errtxt);
    return symbol;
}

} // namespace

std::vector<bool> code128(const QString& content)
{
    const auto symbol = encoded(content);
    std::vector<bool> modules(size_t(symbol->width));
    for (size_t i = 0; i < modules.size(); ++i)
        modules[i] = symbol->encoded_data[0][i / 8] >> (i % 8) & 1;
    return modules;
}

Drawing barcode(const QString& content, QSizeF size)
{
    const auto modules = code128(content);
    const auto module = size.width() / qreal(modules.size() + 2 * quiet_modules);
    RectsItem bars{.fill = ink::black};
    for (size_t i = 0; i < modules.size(); ++i) {
        if (!modules[i])
            continue;
        const auto from = i;
        while (i + 1 < modules.size() && modules[i + 1])
            ++i;
        bars.rects.emplace_back((qreal(from) + quiet_modules) * module, 0, qreal(i - from + 1) * module, size.height());
    }
    return {size, {bars}};
}

} // namespace kindrel::pages
