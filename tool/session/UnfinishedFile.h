#pragma once

#include <string>

#include "tool/session/FilePlace.h"

/// A file that is being written. Others see the old file or the new one, never a part: new text
/// goes into a hidden file in the same folder, which in the end is given the name of the old one;
/// text that is appended is cut off again if it does not become complete. Of all objects one at a
/// time has a file.
///
/// The hidden file of NAME is called .NAME.UID.vesk-hdl and is locked while it is written. One
/// without a lock was left by a run that was killed: the next one that writes NAME removes it. A
/// run that finds a locked one waits, so that two runs that write one file take turns.
class UnfinishedFile {
public:
    UnfinishedFile() = default;
    UnfinishedFile(UnfinishedFile const &) = delete;
    UnfinishedFile &operator=(UnfinishedFile const &) = delete;
    ~UnfinishedFile() { Undo(); }

    /// Begins a file, new or in the place of a regular one, whose permissions and, where possible,
    /// owner it is given in the end; other hard links go on naming the old file. The result is a
    /// descriptor for the text, which the caller closes, or -1 with `errno` set and perhaps a
    /// reason.
    int Begin(FilePlace wanted, std::string &reason);
    /// The same at the end of a regular file, which stays in its place.
    int BeginAppending(FilePlace wanted, std::string &reason);

    bool IsBegun() const { return file.IsOpen(); }
    /// The text is complete: it becomes the file. 0, or the `errno` of what went wrong; the old
    /// file is then as it was.
    int Finish();
    /// Leaves everything as it was before. Does nothing when no file is begun.
    void Undo();
    /// The file that was begun last, and the one in whose place it is.
    struct stat const &GetStatus() const {
        return status;
    }
    struct stat const &GetFormerStatus() const {
        return place.status;
    }

    /// Undo for the one object that has a file, to be called by a signal handler that ends the
    /// program.
    static void UndoInHandler();

private:
    bool Make();
    bool RemoveLeftover(std::string &reason);
    void GiveModeAndOwner() const;
    int Lend() const;

    FilePlace place;
    std::string hiddenName;
    Descriptor file; ///< holds the lock
    struct stat status = {};
};
