// The address of this computer that other computers reach.

#include <gtest/gtest.h>

#include <QHostAddress>
#include <QNetworkInterface>
#include <algorithm>

#include "desktop/platform/QtPlatform.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

TEST(LocalAddress, IsTheMachinesOwnAndNoLoopbackWhereItHasAnother) {
    testApplication();
    QtPlatform platform;
    const QHostAddress shown(QString::fromStdString(platform.serverSocket.localIP()));
    const QList<QHostAddress> all = QNetworkInterface::allAddresses();
    const bool others = std::any_of(all.begin(), all.end(),
                                    [](const QHostAddress& one) { return !one.isLoopback(); });
    if (!others) {
        EXPECT_EQ(shown, QHostAddress(QHostAddress::LocalHost));
        return;
    }
    EXPECT_FALSE(shown.isLoopback());
    EXPECT_TRUE(std::any_of(all.begin(), all.end(), [&](QHostAddress one) {
        one.setScopeId({});
        return one == shown;
    }));
}

}  // namespace
}  // namespace zel
