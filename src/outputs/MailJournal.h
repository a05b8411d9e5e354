#pragma once

#include <QByteArray>
#include <QFile>
#include <QSet>
#include <QString>
#include <QStringList>

namespace pelmar {

// What a campaign has already sent, kept on disk so that a campaign stopped, failed or killed
// half-way can go on without sending anyone a second copy. A campaign is known by everything
// that makes its message and its recipients (sender, subject, body, attachment, method, group
// size, recipient statement); its journal is a file named by a digest of that, in the folder of
// journals. Each recipient whose message the server accepted is written and flushed before the
// next message starts. A finished run removes the journal.
class MailJournal {
public:
    // The journal of the campaign in the folder (created when missing); one left by an earlier
    // run is read. Throws Failure when the folder or the file cannot be used.
    MailJournal(const QString& folder, const QByteArray& campaign);

    // How many recipients an earlier, unfinished run of the campaign sent to.
    qsizetype sentBefore() const { return sent_.size(); }
    // True for a recipient that an earlier run already sent to.
    bool wasSent(const QString& recipient) const { return sent_.contains(recipient); }

    // Forgets what earlier runs sent: the campaign starts over.
    void startOver();
    // Writes the recipients of a message the server accepted. Throws Failure when the journal
    // cannot be written: going on would risk sending them again.
    void record(const QStringList& recipients);
    // The campaign is done: the journal goes.
    void finish();

    // The folder of journals of the user: "Pelmar/mail-journal" in the data folder.
    static QString userFolder();

private:
    void open(QIODevice::OpenMode mode);

    QFile file_;
    QSet<QString> sent_;
};

}  // namespace pelmar
