#pragma once

#include "support/TestPlatform.h"

#include <QByteArray>

#include <functional>
#include <map>
#include <mutex>
#include <utility>
#include <vector>

namespace lumora {

// A lab in memory: an FTP server with folders and files, a web site that notes what it is asked, and faults by script.
// The line in between may be down, the login refused, a put refused or cut in its middle, a delete refused.
class FakeLab : public NoInternet {
public:
    // Folders by their path below the root, without a leading slash; the root itself is "".
    using Folder = std::map<QString, QByteArray>;
    std::map<QString, Folder> folders = {{QString(), {}}};

    static constexpr int always = -1;
    // True as often as the counter says.
    static bool strikes(int& counter);

    // How often each fault happens from now on; always means every time.
    int deadOpens = 0;    // the machine has no way out
    int deadConnects = 0; // nobody answers
    Failure::Kind deadConnectKind = Failure::Kind::Disconnected;
    int refusedLogins = 0;             // wrong user or password
    int failedListings = 0;            // the line is cut while a listing comes
    bool refusesEmptyListings = false; // with 550
    QString hiddenFolder;              // no listing names it
    QString unreadLine;                // stands in each listing of an order's folder
    bool refusesDelete = false;
    QString heldOpen;            // this name is taken again only once its file is deleted
    bool refusesFolders = false; // no folder can be made
    bool refusesEntry = false;   // the order's folder can't be entered
    bool listsDots = false;      // "." and ".." stand in each listing

    struct PutFault {
        QString name; // empty: any file
        int times = 1;
        // -1: refused, nothing stored. Otherwise the line is cut once so many bytes are stored.
        int cutAfter = -1;
        Failure::Kind kind = Failure::Kind::Disconnected; // of a cut
    };
    std::vector<PutFault> putFaults;

    // What a put that is answered well stores of its content; no value: nothing.
    std::function<std::optional<QByteArray>(const QString& name, const QByteArray& content)> stores;
    bool convertsText = false; // of what is got under type ASCII
    bool listsLengths = true;
    bool tellsSize = true;

    // Runs as a put begins, as something that happens meanwhile.
    std::function<void(const QString& name)> onPut;
    // Runs as a connection is asked for; the number counts from 1.
    std::function<void(int number)> onConnect;
    // Runs while an address of the site is fetched.
    std::function<void()> onFetch;

    // What the server saw.
    QStringList puts; // names, also of puts that failed
    int connects = 0;
    int sizesAsked = 0;
    int aborts = 0;   // each cuts the connections that stand then
    QStringList urls; // in order, as the client gave them

    bool open() override;
    bool connectedState() const override { return deadOpens == 0; }
    Result<std::unique_ptr<FtpConnection>> connectFtp(const QString& host, const QString& user, const QString& password,
                                                      DataChannel channel) override;
    Result<WebAnswer> fetch(const QString& url) override;
    void abort() override {
        const std::lock_guard lock(mutex);
        ++aborts;
    }
    EventPump* pumpWhileWaiting(EventPump* given) override { return std::exchange(pump, given); }
    EventPump* pump = nullptr;  // while a call waits
    std::recursive_mutex mutex; // held by each call but while onPut runs

    DataChannel lastChannel = DataChannel::Passive;
};

} // namespace lumora
