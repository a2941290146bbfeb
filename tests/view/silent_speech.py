"""A speech server that says nothing and remembers what it is told to say.

It speaks the SSIP protocol on a socket, as a screen reader's speech client expects, and answers that every
message was begun and ended at once.
"""

import html
import re
import socketserver
import threading
import time


class SilentSpeech:
    def __init__(self, path):
        self._lock = threading.Lock()
        self._said = []
        speech = self

        class Client(socketserver.StreamRequestHandler):
            def handle(self):
                Conversation(self.rfile, self.wfile, speech).run()

        self._server = socketserver.ThreadingUnixStreamServer(path, Client)
        self._server.daemon_threads = True
        threading.Thread(target=self._server.serve_forever, daemon=True).start()

    def add(self, text):
        with self._lock:
            self._said.append((time.monotonic(), " ".join(text.split())))

    def said(self, since=0):
        """What was said from the message numbered `since` on: pairs of the time and the text."""
        with self._lock:
            return self._said[since:]

    def count(self):
        with self._lock:
            return len(self._said)

    def wait_for(self, test, since, seconds):
        """Waits until the test holds for the texts said, and answers whether it does."""
        end = time.monotonic() + seconds
        while True:
            if test([text for _, text in self.said(since)]):
                return True
            if time.monotonic() > end:
                return False
            time.sleep(0.01)


class Conversation:
    answers = {
        "LIST OUTPUT_MODULES": "250-silent\r\n250 OK MODULE LIST SENT\r\n",
        "LIST SYNTHESIS_VOICES": "249-English\ten\tnone\r\n249 OK VOICE LIST SENT\r\n",
        "LIST VOICES": "249-MALE1\r\n249 OK VOICE LIST SENT\r\n",
        "HISTORY GET CLIENT_ID": "245-1\r\n245 OK CLIENT ID SENT\r\n",
        "GET": "251-silent\r\n251 OK GET RETURNED\r\n",
        "CANCEL": "210 OK CANCELED\r\n",
        "STOP": "210 OK CANCELED\r\n",
    }

    def __init__(self, lines, out, speech):
        self._lines, self._out, self._speech = lines, out, speech
        self._messages = 0
        self._notifies = False

    def run(self):
        try:
            for line in self._lines:
                if not self._answer(line.decode("utf-8", "replace").rstrip("\r\n")):
                    return
        except (BrokenPipeError, ConnectionResetError):
            pass

    def _send(self, text):
        self._out.write(text.encode())
        self._out.flush()

    def _answer(self, line):
        upper = line.upper()
        if upper == "SPEAK":
            self._send("230 OK RECEIVING DATA\r\n")
            self._say(self._message())
        elif upper.startswith(("CHAR ", "KEY ")):
            self._say(line.split(" ", 1)[1])
        elif upper.startswith("SET SELF NOTIFICATION"):
            self._notifies |= upper.endswith(" ON")
            self._send("220 OK NOTIFICATION SET\r\n")
        elif upper == "QUIT":
            self._send("231 HAPPY HACKING\r\n")
            return False
        else:
            known = [answer for start, answer in self.answers.items() if upper.startswith(start)]
            self._send(known[0] if known else "200 OK\r\n")
        return True

    def _message(self):
        lines = []
        for line in self._lines:
            text = line.decode("utf-8", "replace").rstrip("\r\n")
            if text == ".":
                break
            lines.append(text[1:] if text.startswith("..") else text)
        return html.unescape(re.sub(r"<[^>]*>", "", "\n".join(lines)))

    def _say(self, text):
        self._speech.add(text)
        self._messages += 1
        self._send(f"225-{self._messages}\r\n225 OK MESSAGE QUEUED\r\n")
        if self._notifies:
            for code, event in ((701, "BEGIN"), (702, "END")):
                self._send(f"{code}-{self._messages}\r\n{code}-1\r\n{code} {event}\r\n")
