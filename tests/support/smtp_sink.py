#!/usr/bin/python3
"""An SMTP server on 127.0.0.1 for the tests: it records every accepted message with its envelope.

Run it with Debian's /usr/bin/python3 (it needs the python3-aiosmtpd package). It prints
"ready PORT" on stdout once it accepts connections, and records in the folder given:

  000001.eml   the message's DATA as received (dot-unstuffed, CR LF kept)
  000001.json  {"mail_from": ..., "rcpt_tos": [...]}, written after the .eml and renamed into
               place, so a reader that sees the .json sees the whole message
  connections  the number of connections accepted so far

Both files of a message exist before the client gets its 250 for the DATA. The server stops on
SIGTERM and when the process that started it dies.
"""

import argparse
import asyncio
import json
import logging
import os
import signal
import ssl
import sys
import warnings

from aiosmtpd.smtp import SMTP, AuthResult


def write_atomically(path, data):
    temporary = path + ".tmp"
    with open(temporary, "wb") as f:
        f.write(data)
    os.replace(temporary, path)


class Recorder:
    """The aiosmtpd handler: refuses the chosen recipients and records what is accepted."""

    def __init__(self, folder, refused, deferred):
        self.folder = folder
        self.refused = set(refused)
        self.deferred = set(deferred)
        self.accepted = 0
        self.connections = 0
        self.count_connection(0)

    def count_connection(self, increment=1):
        self.connections += increment
        write_atomically(os.path.join(self.folder, "connections"), str(self.connections).encode())

    async def handle_RCPT(self, server, session, envelope, address, rcpt_options):
        if address in self.refused:
            return f"550 5.1.1 <{address}>: Recipient address rejected"
        if address in self.deferred:
            return f"450 4.2.1 <{address}>: Mailbox busy, try again later"
        envelope.rcpt_tos.append(address)
        envelope.rcpt_options.extend(rcpt_options)
        return "250 OK"

    async def handle_DATA(self, server, session, envelope):
        self.accepted += 1
        base = os.path.join(self.folder, f"{self.accepted:06d}")
        write_atomically(base + ".eml", envelope.original_content)
        envelope_json = {"mail_from": envelope.mail_from, "rcpt_tos": envelope.rcpt_tos}
        write_atomically(base + ".json", json.dumps(envelope_json).encode())
        return "250 OK"


class Session(SMTP):
    """One connection. Once the accept limit is reached, MAIL is answered 421 and the connection
    closed, as a server that goes away in the middle of a run."""

    def __init__(self, recorder, accept_limit, **kwargs):
        super().__init__(recorder, **kwargs)
        self.recorder = recorder
        self.accept_limit = accept_limit

    async def smtp_MAIL(self, arg):
        if 0 <= self.accept_limit <= self.recorder.accepted:
            await self.push("421 4.3.2 Service shutting down")
            self._handler_coroutine.cancel()
            self.transport.close()
            return
        await super().smtp_MAIL(arg)


def parse_arguments():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--port", type=int, default=0, help="0: a free port")
    parser.add_argument("--folder", required=True)
    parser.add_argument("--refuse", action="append", default=[], metavar="ADDR")
    parser.add_argument("--defer", action="append", default=[], metavar="ADDR", help="450 at RCPT TO")
    parser.add_argument("--tls-cert")
    parser.add_argument("--tls-key")
    parser.add_argument("--require-tls", action="store_true")
    parser.add_argument("--implicit-tls", action="store_true", help="TLS from the first byte, no STARTTLS")
    parser.add_argument("--auth", metavar="USER:PASSWORD")
    parser.add_argument("--accept-limit", type=int, default=-1, metavar="N")
    arguments = parser.parse_args()
    if bool(arguments.tls_cert) != bool(arguments.tls_key):
        parser.error("--tls-cert and --tls-key go together")
    if (arguments.require_tls or arguments.implicit_tls) and not arguments.tls_cert:
        parser.error("--require-tls needs --tls-cert and --tls-key")
    if arguments.auth is not None and ":" not in arguments.auth:
        parser.error("--auth takes USER:PASSWORD")
    return arguments


def tls_context(arguments):
    if not arguments.tls_cert:
        return None
    context = ssl.create_default_context(ssl.Purpose.CLIENT_AUTH)
    context.load_cert_chain(arguments.tls_cert, arguments.tls_key)
    return context


def session_options(arguments):
    options = {"hostname": "localhost", "enable_SMTPUTF8": True}
    if arguments.tls_cert and not arguments.implicit_tls:
        options.update(tls_context=tls_context(arguments), require_starttls=arguments.require_tls)
    if arguments.auth is not None:
        user, password = arguments.auth.split(":", 1)
        expected = (user.encode(), password.encode())

        def authenticator(server, session, envelope, mechanism, login_password):
            # handled=False: aiosmtpd then answers a failure with 535 itself.
            success = (login_password.login, login_password.password) == expected
            return AuthResult(success=success, handled=False)

        # AUTH is offered without TLS too, so that a test can check the credentials alone.
        options.update(authenticator=authenticator, auth_required=True, auth_require_tls=False)
    return options


async def serve(arguments):
    os.makedirs(arguments.folder, exist_ok=True)
    recorder = Recorder(arguments.folder, arguments.refuse, arguments.defer)
    options = session_options(arguments)
    loop = asyncio.get_running_loop()

    def new_session():
        recorder.count_connection()
        return Session(recorder, arguments.accept_limit, loop=loop, **options)

    implicit = tls_context(arguments) if arguments.implicit_tls else None
    server = await loop.create_server(new_session, host="127.0.0.1", port=arguments.port, ssl=implicit)
    stopped = loop.create_future()
    for signal_number in (signal.SIGTERM, signal.SIGINT):
        loop.add_signal_handler(signal_number, lambda: stopped.done() or stopped.set_result(None))

    print(f"ready {server.sockets[0].getsockname()[1]}", flush=True)

    # A parent that dies leaves this process to another one: then nobody will stop it.
    parent = os.getppid()
    while not stopped.done() and os.getppid() == parent:
        await asyncio.wait([stopped], timeout=1)
    server.close()


def main():
    arguments = parse_arguments()
    # Only failures reach stderr: aiosmtpd warns about AUTH without TLS, which is wanted here.
    logging.basicConfig(level=logging.ERROR)
    warnings.simplefilter("ignore")
    asyncio.run(serve(arguments))
    return 0


if __name__ == "__main__":
    sys.exit(main())
