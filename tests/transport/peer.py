"""Speaks the wire form with transport_peer, as its client and as its server: peer.py COMMAND..."""
import socket, struct, subprocess, sys

BLOCK = bytes((i * 31 + i // 4096) % 256 for i in range(1 << 18))
FIELDS = struct.pack("<iii??i2si", 0x01020304, -2, -(1 << 31), True, False, 2, b"ab", 0) + BLOCK


def receive(connection, size):
    data = b""
    while len(data) < size:
        part = connection.recv(min(size - len(data), 777))
        if not part:
            sys.exit("the peer closed behind %d of %d bytes" % (len(data), size))
        data += part
    return data


def exchange(connection, sends_first):
    connection.settimeout(60)
    for turn in range(2):
        if (turn % 2 == 0) == sends_first:
            connection.sendall(FIELDS[:1])  # a field in pieces
            connection.sendall(FIELDS[1:])
        elif receive(connection, len(FIELDS)) != FIELDS:
            sys.exit("turn %d: other bytes than expected" % turn)


def finish(process):
    if process.wait(60) != 0:
        sys.exit("the peer ended with %d" % process.returncode)


server = subprocess.Popen(sys.argv[1:] + ["server"], stdout=subprocess.PIPE)
while not (line := server.stdout.readline()).startswith(b"port"):
    if not line:
        sys.exit("the server told no port")
with socket.create_connection(("127.0.0.1", int(line.split()[1])), 60) as connection:
    exchange(connection, True)
finish(server)
with socket.create_server(("127.0.0.1", 0)) as listener:
    listener.settimeout(60)
    client = subprocess.Popen(sys.argv[1:] + ["client", str(listener.getsockname()[1])])
    with listener.accept()[0] as connection:
        exchange(connection, False)
finish(client)
