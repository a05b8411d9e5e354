#include "outputs/MailJournal.h"

#include "common/Failure.h"

#include <QCryptographicHash>
#include <QDir>
#include <QStandardPaths>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

[[noreturn]] void journalFailure(const QFile& file)
{
    throw Failure(u"לא ניתן לכתוב ביומן המשלוח \"%1\": %2. הדיוור נעצר כדי שאף נמען לא יקבל את ההודעה פעמיים."_s.arg(
        file.fileName(), file.errorString()));
}

}  // namespace

MailJournal::MailJournal(const QString& folder, const QByteArray& campaign)
{
    if (!QDir().mkpath(folder))
        throw Failure(u"לא ניתן ליצור את תיקיית יומני המשלוח \"%1\"."_s.arg(folder));
    const QByteArray digest = QCryptographicHash::hash(campaign, QCryptographicHash::Sha256).toHex();
    file_.setFileName(QDir(folder).filePath(QString::fromLatin1(digest.left(32)) + u".journal"_s));
    if (file_.exists()) {
        if (!file_.open(QIODevice::ReadOnly))
            journalFailure(file_);
        for (const QByteArray& line : file_.readAll().split('\n')) {
            if (!line.isEmpty())
                sent_.insert(QString::fromUtf8(line));
        }
        file_.close();
    }
    open(QIODevice::Append);
}

void MailJournal::open(QIODevice::OpenMode mode)
{
    file_.close();
    if (!file_.open(mode | QIODevice::WriteOnly))
        journalFailure(file_);
    file_.setPermissions(QFileDevice::ReadOwner | QFileDevice::WriteOwner);
}

void MailJournal::startOver()
{
    sent_.clear();
    open(QIODevice::Truncate);
}

void MailJournal::record(const QStringList& recipients)
{
    QByteArray lines;
    for (const QString& recipient : recipients) {
        lines += recipient.toUtf8() + '\n';
        sent_.insert(recipient);
    }
    if (file_.write(lines) != lines.size() || !file_.flush())
        journalFailure(file_);
}

void MailJournal::finish()
{
    file_.close();
    file_.remove();
}

QString MailJournal::userFolder()
{
    const QString data = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation);
    return QDir(data).filePath(u"Pelmar/mail-journal"_s);
}

}  // namespace pelmar
