// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <qpa/qplatformintegration.h>
#include <qpa/qplatformintegrationfactory_p.h>
#include <qpa/qplatformintegrationplugin.h>
#include <qpa/qplatformnativeinterface.h>

#include <sys/mman.h>

namespace {

// Answers for a display, as that of Wayland does, with something that nobody may take for one.
class NativeInterface : public QPlatformNativeInterface
{
    Q_OBJECT

public:
    ~NativeInterface() override { ::munmap(m_page, Size); }

    void *nativeResourceForIntegration(const QByteArray &resource) override
    {
        return resource == "display" ? m_page : nullptr;
    }

private:
    static constexpr std::size_t Size = 64 * 1024;
    void *const m_page = ::mmap(nullptr, Size, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
};

// The offscreen platform in all else.
class Integration : public QPlatformIntegration
{
public:
    Integration(int &argc, char **argv)
        : m_offscreen(QPlatformIntegrationFactory::create(QStringLiteral("offscreen"), {}, argc, argv))
    {
    }

    void initialize() override { m_offscreen->initialize(); }
    bool hasCapability(Capability capability) const override
    {
        return m_offscreen->hasCapability(capability);
    }
    QPlatformWindow *createPlatformWindow(QWindow *window) const override
    {
        return m_offscreen->createPlatformWindow(window);
    }
    QPlatformBackingStore *createPlatformBackingStore(QWindow *window) const override
    {
        return m_offscreen->createPlatformBackingStore(window);
    }
    QAbstractEventDispatcher *createEventDispatcher() const override
    {
        return m_offscreen->createEventDispatcher();
    }
    QPlatformFontDatabase *fontDatabase() const override { return m_offscreen->fontDatabase(); }
    QPlatformClipboard *clipboard() const override { return m_offscreen->clipboard(); }
    QPlatformDrag *drag() const override { return m_offscreen->drag(); }
    QPlatformInputContext *inputContext() const override { return m_offscreen->inputContext(); }
    QPlatformServices *services() const override { return m_offscreen->services(); }
    QStringList themeNames() const override { return m_offscreen->themeNames(); }
    QPlatformTheme *createPlatformTheme(const QString &name) const override
    {
        return m_offscreen->createPlatformTheme(name);
    }
    QPlatformNativeInterface *nativeInterface() const override { return &m_native; }

private:
    const std::unique_ptr<QPlatformIntegration> m_offscreen;
    mutable NativeInterface m_native;
};

} // namespace

/// A platform whose display is none of X11's.
class OtherPlatform : public QPlatformIntegrationPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QPlatformIntegrationFactoryInterface_iid FILE "OtherPlatform.json")

public:
    QPlatformIntegration *create(const QString &, const QStringList &, int &argc, char **argv) override
    {
        return new Integration(argc, argv); // Qt owns it
    }
};

#include "OtherPlatform.moc"
