#include "Platform/WebPost.h"

#include "support/EnvironmentVariable.h"
#include "support/HttpServer.h"

#include <QTest>

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

namespace {

/// Without a proxy in between.
class WebPostTest : public testing::Test {
    EnvironmentVariable mProxy{"http_proxy", ""};
};

WebPost::Form formFor(const HttpServer& server) {
    return {"127.0.0.1", server.serverPort(), "folder/script.php", "p=1&w=v", "Agent"};
}

} // namespace

TEST_F(WebPostTest, SendsTheFormAsItIsAndReturnsTheReply) {
    HttpServer server("an answer");
    WebPost::Form form = formFor(server);
    const WebPost::Reply reply = WebPost::post(form);
    EXPECT_EQ(reply.body, "an answer");
    EXPECT_EQ(reply.error, "");
    ASSERT_EQ(server.requests.size(), 1);
    QByteArrayList lines = server.requests[0].replace("\r\n", "\n").split('\n');
    EXPECT_EQ(lines.takeFirst(), "POST /folder/script.php HTTP/1.1");
    EXPECT_EQ(lines.takeLast(), "p=1&w=v");
    EXPECT_EQ(lines.takeLast(), "");
    lines.removeIf([](const QByteArray& line) { return line.startsWith("Accept-Language: "); });
    std::sort(lines.begin(), lines.end());
    EXPECT_EQ(lines.join('\n'), "Accept-Encoding: identity\nConnection: Keep-Alive\nContent-Length: 7\n"
                                "Content-Type: application/x-www-form-urlencoded\nHost: 127.0.0.1:" +
                                    QByteArray::number(form.port) + "\nUser-Agent: Agent");
}

TEST_F(WebPostTest, ReturnsWhatAServerSaysWithAnyStatusAndFollowsNobodyElsewhere) {
    HttpServer elsewhere("from elsewhere");
    HttpServer server;
    server.reply = "HTTP/1.1 307 Temporary Redirect\r\nLocation: http://" + elsewhere.address() +
                   "/\r\nContent-Length: 5\r\n\r\nmoved";
    EXPECT_EQ(WebPost::post(formFor(server)).body, "moved");
    EXPECT_TRUE(elsewhere.requests.isEmpty());
    server.reply = "HTTP/1.1 500 Internal Server Error\r\nContent-Length: 4\r\n\r\noops";
    EXPECT_EQ(WebPost::post(formFor(server)).body, "oops");
    server.reply = HttpServer::ok("");
    EXPECT_EQ(WebPost::post(formFor(server)).body, "");
    EXPECT_EQ(server.requests.size(), 3);
}

TEST_F(WebPostTest, GivesUpWhereNothingComesOrTooSlowly) {
    for (const auto manner : {HttpServer::WithNothing, HttpServer::LittleByLittle, HttpServer::ByHangingUp}) {
        HttpServer server(QByteArray(100000, 'x'), manner);
        WebPost::Form form = formFor(server);
        form.limit = std::chrono::milliseconds(150);
        const WebPost::Reply reply = WebPost::post(form);
        EXPECT_EQ(reply.error, "Unable to send data to server.") << manner;
        EXPECT_EQ(reply.body, "") << manner;
        EXPECT_TRUE(QTest::qWaitFor([&server] { return server.dropped > 0; })) << manner;
    }
    HttpServer closed;
    const WebPost::Form form = formFor(closed);
    closed.close();
    EXPECT_EQ(WebPost::post(form).error, "Unable to send data to server.");
}

TEST_F(WebPostTest, ReadsNoFurtherThanItsLimit) {
    HttpServer server({}, HttpServer::WithoutEnd);
    WebPost::Form form = formFor(server);
    form.limit = std::chrono::minutes(1);
    EXPECT_EQ(WebPost::post(form).body, std::string(WebPost::kMostBytes, 'x'));
    EXPECT_TRUE(QTest::qWaitFor([&server] { return server.dropped > 0; }));
}
