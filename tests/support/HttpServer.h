#pragma once

#include <QCoreApplication>
#include <QTcpServer>
#include <QTcpSocket>
#include <QTimer>

namespace orvela {

/// A web server on the loopback address, served by the event loop of its thread.
class HttpServer : public QTcpServer {
public:
    /// What it answers every request with.
    enum Manner { WithReply, WithNothing, ByHangingUp, LittleByLittle, WithoutEnd };

    explicit HttpServer(QByteArray answer = {}, Manner manner = WithReply)
        : reply(ok(answer)), mManner(manner) {
        listen(QHostAddress::LocalHost);
        connect(this, &QTcpServer::newConnection, this, [this] { serve(nextPendingConnection()); });
    }

    /// A whole reply with status 200 and this content.
    static QByteArray ok(const QByteArray& content) {
        return "HTTP/1.1 200 OK\r\nContent-Length: " + QByteArray::number(content.size()) + "\r\n\r\n" +
               content;
    }

    QByteArray address() const { return "127.0.0.1:" + QByteArray::number(serverPort()); }

    QByteArray reply;
    QList<QByteArray> requests; ///< every byte of them
    int dropped = 0;            ///< connections that the other side has ended

private:
    void serve(QTcpSocket* socket) {
        requests.append(QByteArray());
        const auto index = requests.size() - 1;
        connect(socket, &QTcpSocket::disconnected, this, [this] { ++dropped; });
        connect(socket, &QTcpSocket::readyRead, this, [this, socket, index] {
            QByteArray& request = requests[index];
            request += socket->readAll();
            if (request.endsWith("\r\n\r\np=1&w=v"))
                respond(socket);
        });
    }

    void respond(QTcpSocket* socket) {
        if (mManner == WithReply)
            socket->write(reply);
        else if (mManner == ByHangingUp)
            socket->disconnectFromHost();
        else if (mManner == LittleByLittle)
            everyMillisecond(socket,
                             [this, socket, sent = 0]() mutable { socket->write(reply.mid(sent++, 1)); });
        else if (mManner == WithoutEnd) {
            socket->write("HTTP/1.1 200 OK\r\n\r\n");
            everyMillisecond(socket, [socket] { socket->write(QByteArray(100000, 'x')); });
        }
    }

    template <typename Action>
    void everyMillisecond(QTcpSocket* socket, Action action) {
        auto* timer = new QTimer(socket);
        connect(timer, &QTimer::timeout, socket, action);
        timer->start(1);
    }

    Manner mManner;
};

} // namespace orvela
