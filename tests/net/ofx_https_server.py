#!/usr/bin/env python3
"""Loopback-only HTTPS server for the transport tests (stdlib only).

POST or GET /ofx              the reply file (POST needs Content-Type application/x-ofx, else 415)
POST or GET /status/NNN       an empty answer with HTTP status NNN
POST or GET /slow/MS          the reply file after MS milliseconds (at most 10000)
POST /echo                    the request body back
POST or GET /redirect         307 to /ofx?case=redirected
Every request that reaches a handler appends "METHOD PATH BYTES" to the request log; a POST
whose body never came in full (a client that refused the server after sending the headers)
is logged as "HEADERS-ONLY PATH BYTES". The server binds 127.0.0.1 only and stops by
itself after --max-requests requests or --lifetime seconds.
"""
import argparse
import http.server
import ssl
import sys
import threading
import time


def main():
    ap = argparse.ArgumentParser()
    ap.add_argument("--cert", required=True)
    ap.add_argument("--key", required=True)
    ap.add_argument("--reply", required=True)
    ap.add_argument("--port-file", required=True)
    ap.add_argument("--request-log", required=True)
    ap.add_argument("--max-requests", type=int, default=300)
    ap.add_argument("--lifetime", type=float, default=600.0)
    a = ap.parse_args()
    reply = open(a.reply, "rb").read()
    state = {"n": 0}
    lock = threading.Lock()

    class Handler(http.server.BaseHTTPRequestHandler):
        protocol_version = "HTTP/1.1"

        def log_message(self, fmt, *args):
            sys.stderr.write("server: " + fmt % args + "\n")

        def answer(self, code, body, location=None):
            self.send_response(code)
            if location:
                self.send_header("Location", location)
            self.send_header("Content-Type", "application/x-ofx")
            self.send_header("X-OESDK-Test", "loopback")
            self.send_header("Content-Length", str(len(body)))
            self.end_headers()
            if self.command != "HEAD":
                self.wfile.write(body)

        def handle_any(self, body, complete=True):
            with lock:
                with open(a.request_log, "a") as log:
                    method = self.command if complete else "HEADERS-ONLY"
                    log.write(f"{method} {self.path} {len(body)}\n")
                state["n"] += 1
                if state["n"] >= a.max_requests:
                    threading.Thread(target=self.server.shutdown, daemon=True).start()
            if not complete:
                self.close_connection = True
                return
            path = self.path.split("?")[0]
            ctype = self.headers.get("Content-Type", "").split(";")[0].strip().lower()
            if path == "/ofx":
                if self.command == "POST" and ctype != "application/x-ofx":
                    return self.answer(415, b"")
                return self.answer(200, reply)
            if path == "/redirect":
                return self.answer(307, b"", "/ofx?case=redirected")
            if path == "/echo":
                return self.answer(200, body)
            if path.startswith("/status/"):
                return self.answer(int(path[8:11]), b"")
            if path.startswith("/slow/"):
                time.sleep(min(int(path[6:]), 10000) / 1000.0)
                return self.answer(200, reply)
            return self.answer(404, b"")

        def do_POST(self):
            n = int(self.headers.get("Content-Length", "0"))
            try:
                body = self.rfile.read(n) if n > 0 else b""
            except (OSError, ssl.SSLError):
                body = b""
            self.handle_any(body, len(body) == n)

        def do_GET(self):
            self.handle_any(b"")

    srv = http.server.ThreadingHTTPServer(("127.0.0.1", 0), Handler)
    srv.daemon_threads = True
    ctx = ssl.SSLContext(ssl.PROTOCOL_TLS_SERVER)
    ctx.minimum_version = ssl.TLSVersion.TLSv1_2
    ctx.load_cert_chain(a.cert, a.key)
    srv.socket = ctx.wrap_socket(srv.socket, server_side=True)
    with open(a.port_file + ".tmp", "w") as f:
        f.write(str(srv.server_address[1]))
    import os
    os.replace(a.port_file + ".tmp", a.port_file)
    timer = threading.Timer(a.lifetime, srv.shutdown)
    timer.daemon = True
    timer.start()
    srv.serve_forever()
    srv.server_close()


if __name__ == "__main__":
    main()
