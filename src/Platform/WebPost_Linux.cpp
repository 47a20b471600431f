#include "Platform/WebPost.h"

#include <QEventLoop>
#include <QNetworkAccessManager>
#include <QNetworkProxy>
#include <QNetworkReply>
#include <QTimer>

#include <memory>

namespace orvela {

namespace WebPost {

namespace {

constexpr auto kMost = static_cast<qint64>(kMostBytes);

// The proxy that the environment names. That of the desktop is not asked for: looking it up may itself ask
// the net, and cannot be given up.
QNetworkProxy proxyOfEnvironment() {
    const QUrl url = QUrl::fromUserInput(qEnvironmentVariable("http_proxy"));
    if (url.host().isEmpty())
        return QNetworkProxy::NoProxy;
    return {QNetworkProxy::HttpProxy, url.host(), static_cast<quint16>(url.port(8080)), url.userName(),
            url.password()};
}

QNetworkRequest requestOf(const Form& form) {
    QUrl url;
    url.setScheme(QStringLiteral("http"));
    url.setHost(QString::fromStdString(form.host));
    if (form.port != 80)
        url.setPort(form.port); // the request would name the usual one too
    url.setPath(QLatin1Char('/') + QString::fromStdString(form.path));
    QNetworkRequest request(url);
    request.setHeader(QNetworkRequest::ContentTypeHeader,
                      QByteArrayLiteral("application/x-www-form-urlencoded"));
    request.setHeader(QNetworkRequest::UserAgentHeader, QByteArray::fromStdString(form.agent));
    // As it is: nothing that unpacks to more than was sent.
    request.setRawHeader("Accept-Encoding", "identity");
    request.setAttribute(QNetworkRequest::RedirectPolicyAttribute, QNetworkRequest::ManualRedirectPolicy);
    return request;
}

// Returns once the reply is there, as far as it is wanted, or the time is up.
void await(const QNetworkReply& reply, std::chrono::milliseconds limit) {
    QEventLoop loop;
    QTimer time;
    QObject::connect(&time, &QTimer::timeout, &loop, &QEventLoop::quit);
    time.start(limit);
    QObject::connect(&reply, &QNetworkReply::finished, &loop, &QEventLoop::quit);
    QObject::connect(&reply, &QNetworkReply::readyRead, &loop, [&reply, &loop] {
        if (reply.bytesAvailable() >= kMost)
            loop.quit();
    });
    loop.exec(QEventLoop::ExcludeUserInputEvents);
}

} // namespace

Reply post(const Form& form) {
    QNetworkAccessManager manager;
    manager.setProxy(proxyOfEnvironment());
    const std::unique_ptr<QNetworkReply> reply(
        manager.post(requestOf(form), QByteArray::fromStdString(form.body)));
    reply->setReadBufferSize(kMost);
    await(*reply, form.limit);
    const bool complete = reply->isFinished() || reply->bytesAvailable() >= kMost;
    if (!complete || !reply->attribute(QNetworkRequest::HttpStatusCodeAttribute).isValid())
        return {{}, "Unable to send data to server."};
    return {reply->read(kMost).toStdString(), {}};
}

} // namespace WebPost

} // namespace orvela
