#include "FileDrop.h"

#include "Theme.h"

#include <QCoreApplication>
#include <QDropEvent>
#include <QFile>
#include <QMimeData>
#include <QProcess>
#include <QUrl>
#include <QWidget>

#include <utility>
#include <vector>

namespace orvex {

namespace {

std::vector<std::string> filesIn(const QMimeData& data)
{
    std::vector<std::string> paths;
    for (const QUrl& url : data.urls()) {
        if (url.isLocalFile())
            paths.push_back(QFile::encodeName(url.toLocalFile()).toStdString());
    }
    return paths;
}

} // namespace

FileDrop::FileDrop(QWidget& window, std::function<void(const std::string& path)> onFile)
    : QObject(&window)
    , _onFile(std::move(onFile))
{
    window.setAcceptDrops(true);
    window.installEventFilter(this);
}

bool FileDrop::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() != QEvent::DragEnter && event->type() != QEvent::Drop)
        return QObject::eventFilter(watched, event);
    auto* const drop = static_cast<QDropEvent*>(event); // the base of the other
    const auto paths = filesIn(*drop->mimeData());
    if (paths.empty())
        return false;
    drop->acceptProposedAction();
    if (event->type() == QEvent::Drop) {
        for (const std::string& path : paths)
            _onFile(path);
    }
    return true;
}

bool openInAnotherProcess(const std::string& path, const QWidget& window)
{
    const QString size = QStringLiteral("%1x%2").arg(window.width()).arg(window.height());
    const QString theme = Theme::isDark() ? QStringLiteral("--dark") : QStringLiteral("--light");
    return QProcess::startDetached(QCoreApplication::applicationFilePath(),
        {QStringLiteral("--alert"), theme, QStringLiteral("--size"), size, QStringLiteral("--"),
            QFile::decodeName(path.c_str())});
}

} // namespace orvex
