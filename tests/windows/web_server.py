"""A web server on this machine that answers one request after the other in a given manner."""
import socket
import threading
import time


def answer(body, status="200 OK", head=""):
    return f"HTTP/1.1 {status}\r\n{head}Content-Length: {len(body)}\r\n\r\n{body}".encode()


def whole(connection, reply):
    connection.sendall(reply)


def nothing(connection, _):
    connection.settimeout(20)
    connection.recv(1)  # until the other side hangs up


def little_by_little(connection, reply):
    for byte in reply:
        connection.sendall(bytes([byte]))
        time.sleep(0.05)


def without_end(connection, reply):
    connection.sendall(b"HTTP/1.1 200 OK\r\n\r\n")
    while True:
        connection.sendall(reply)


class WebServer:
    """While it is entered; `requests` holds (lines of the head, body), `dropped` counts who hung up early."""

    def __init__(self, reply=b"", manner=whole):
        self.reply, self.manner = reply, manner
        self.requests, self.dropped = [], 0
        self.listener = socket.create_server(("127.0.0.1", 0))
        self.port = self.listener.getsockname()[1]

    def __enter__(self):
        self.thread = threading.Thread(target=self._serve)
        self.thread.start()
        return self

    def __exit__(self, *_):
        self.listener.shutdown(socket.SHUT_RDWR)
        self.listener.close()
        self.thread.join()

    def _serve(self):
        while True:
            try:
                connection, _ = self.listener.accept()
            except OSError:
                return
            with connection:
                try:
                    self.requests.append(self._read(connection))
                    self.manner(connection, self.reply)
                except OSError:
                    self.dropped += 1

    @staticmethod
    def _read(connection):
        connection.settimeout(20)
        data = b""
        while b"\r\n\r\n" not in data:
            data += WebServer._more(connection)
        head, body = data.split(b"\r\n\r\n", 1)
        lines = head.decode().split("\r\n")
        length = int(next((line[16:] for line in lines if line.startswith("Content-Length: ")), 0))
        while len(body) < length:
            body += WebServer._more(connection)
        return lines, body.decode()

    @staticmethod
    def _more(connection):
        data = connection.recv(4096)
        if not data:
            raise OSError("hung up")
        return data
