#pragma once

#include "platform/line/Encryption.h"
#include "platform/line/FtpSessionWire.h"
#include "platform/line/Internet.h"

namespace lumora {

// The line of the running program.
class PocoInternet : public Internet {
public:
    explicit PocoInternet(TimeLimits limits = {}, FtpType type = FtpType::Ascii, const LineEncryption& encryption = {});
    ~PocoInternet() override;

    bool open() override { return connectedState(); }
    // An interface with an address is up; which net it leads to is for the calls to find out.
    bool connectedState() const override;
    Result<std::unique_ptr<FtpConnection>> connectFtp(const QString& host, const QString& user, const QString& password,
                                                      DataChannel channel) override;
    void abort() override;
    EventPump* pumpWhileWaiting(EventPump* pump) override;
    qint64 bytesMoved() const override;
    Result<WebAnswer> fetch(const QString& url) override;
    Result<WebAnswer> post(const QString& url, const PostRequest& request) override;
    Result<std::optional<qint64>> contentLength(const QString& url) override;
    Result<void> download(const QString& url, const HostPath& target) override;

    // What the connections share with this.
    struct Line;

private:
    LineCall call() const;

    TimeLimits m_limits;
    FtpType m_type;
    FtpTls m_tls;
    std::shared_ptr<Line> m_line;
};

} // namespace lumora
