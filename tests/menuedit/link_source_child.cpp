// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// link_source_child TITLE URL...
//
// Shows a small window at the right of the screen from which the URLs can be dragged as from a browser,
// with TITLE for the first. Prints "ready" when it is shown, then the action of each drag.

#include <QApplication>
#include <QDrag>
#include <QMimeData>
#include <QMouseEvent>
#include <QTimer>
#include <QUrl>
#include <QWidget>

#include <cstdio>

namespace {

class Page : public QWidget
{
public:
    Page(const QByteArray &title, const QList<QUrl> &urls)
        : m_title(title)
        , m_urls(urls)
    {
    }

protected:
    void mouseMoveEvent(QMouseEvent *event) override
    {
        if (!(event->buttons() & Qt::LeftButton))
            return;
        auto *page = new QMimeData;
        page->setUrls(m_urls);
        page->setData(QStringLiteral("_NETSCAPE_URL"), m_urls.constFirst().toEncoded() + '\n' + m_title);
        auto *drag = new QDrag(this);
        drag->setMimeData(page);
        std::printf("%d\n", int(drag->exec(Qt::CopyAction | Qt::LinkAction, Qt::LinkAction)));
    }

private:
    const QByteArray m_title;
    const QList<QUrl> m_urls;
};

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    QList<QUrl> urls;
    for (const QString &argument : arguments.mid(2))
        urls.append(QUrl(argument));
    if (urls.isEmpty())
        return 2;
    Page page(arguments.at(1).toUtf8(), urls);
    page.setWindowTitle(QStringLiteral("page"));
    page.setGeometry(900, 100, 200, 200);
    page.show();
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);
    QTimer::singleShot(500, &page, [] { std::puts("ready"); });
    return QApplication::exec();
}
