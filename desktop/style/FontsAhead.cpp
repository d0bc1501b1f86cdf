#include "desktop/style/FontsAhead.h"

#include <QFontMetrics>
#include <QGuiApplication>
#include <system_error>

#include "desktop/style/StyleTables.h"

namespace zel {

FontsAhead::FontsAhead() {
    // A font of its own: copies of one share what is found for it, without a lock.
    const QStringList families = QGuiApplication::font().families();
    try {
        work_ = std::thread([families] {
            QFont font(families);
            font.setPixelSize(kBaseFontPixels);
            static_cast<void>(QFontMetrics(font).height());
        });
    } catch (const std::system_error&) {
        // Without a thread the window looks for them itself.
    }
}

void FontsAhead::wait() {
    if (work_.joinable()) work_.join();
}

}  // namespace zel
