"""A far line to an FTP server on this machine: each byte takes a while, and a connection carries only so many a second."""
import asyncio
import threading

PIECE = 16384
ON_THE_WAY = 131072    # bytes that a connection holds before its sender has to wait


class Relay:
    """Listens on `near` for the control port and the ports of the data, under the numbers that the server has on `far`, so that no
    reply needs to be changed. delay: seconds each way; rate: bytes a second and connection, each way."""

    def __init__(self, near, far, control, data, delay, rate):
        self.near, self.far, self.control, self.delay, self.rate = near, far, control, delay, rate
        self.first = self.last = None    # when the first connection came, and when the last control line was closed
        self.connections = self.standing = self.most = 0    # control lines: all, now, at once
        self.loop = asyncio.new_event_loop()
        started = threading.Event()
        self.thread = threading.Thread(target=self.serve, args=([control, *data], started), daemon=True)
        self.thread.start()
        started.wait()

    def serve(self, ports, started):
        asyncio.set_event_loop(self.loop)
        self.servers = [self.loop.run_until_complete(asyncio.start_server(self.opened(port), self.near, port)) for port in ports]
        self.loop.call_soon(started.set)
        self.loop.run_forever()

    def begin(self):
        self.first = self.last = None
        self.connections = self.most = 0

    def stop(self):
        self.loop.call_soon_threadsafe(self.loop.stop)
        self.thread.join()

    def opened(self, port):
        async def session(reader, writer):
            if port == self.control:
                self.first = self.first or self.loop.time()
                self.connections += 1
                self.standing += 1
                self.most = max(self.most, self.standing)
            try:
                far_reader, far_writer = await asyncio.open_connection(self.far, port)
            except OSError:
                writer.transport.abort()
                return
            await asyncio.gather(self.carry(reader, far_writer), self.carry(far_reader, writer))
            for end in (writer, far_writer):
                end.close()
            if port == self.control:
                self.standing -= 1
                self.last = self.loop.time()
        return session

    async def carry(self, reader, writer):
        """Takes no more from the sender than fits on the way."""
        pieces = asyncio.Queue(ON_THE_WAY // PIECE)

        async def arrive():
            while True:
                due, piece = await pieces.get()
                await asyncio.sleep(max(0, due - self.loop.time()))
                if not piece:
                    return
                writer.write(piece)
                await writer.drain()

        arriving = asyncio.ensure_future(arrive())
        free = 0.0    # when the line has carried what was given to it
        try:
            piece = True
            while piece:
                piece = await reader.read(PIECE)
                free = max(free, self.loop.time()) + len(piece) / self.rate
                await pieces.put((free + self.delay, piece))
            await arriving
            if writer.can_write_eof():
                writer.write_eof()
        except OSError:
            arriving.cancel()
            writer.transport.abort()
