#pragma once
// Everything inside a folder of the phone, one entry after the other, without following symbolic links and
// without recursion: a tree of any depth needs one descriptor and no stack.
//
//     ZelSvcFolderWalk walk{"/opt/usr/media/Images"};
//     for (Step step = walk.next(); step != Step::End; step = walk.next())
//         if (step == Step::Entry && walk.is_folder()) walk.enter();   // else the folder is passed over
//
// What appears in a folder after the walk has entered it is not seen.

#include "base/zel-svc-file.h"

#include <string>
#include <sys/stat.h>
#include <vector>

class ZelSvcFolderWalk {
  public:
    enum class Step {
        Entry, // something inside the current folder
        Leave, // a folder that was entered is done; it stands in the current folder again
        End,
    };

    // A link to a folder is followed here, and only here.
    explicit ZelSvcFolderWalk(const char *path);
    explicit operator bool() const { return static_cast<bool>(folder_); }

    Step next();
    // Goes into the folder that next() gave; false when it cannot be read.
    bool enter();

    // Of the last step: its name in folder(), its path below the start, and its own status (all zero when
    // it cannot be had; not looked at for Leave).
    [[nodiscard]] const std::string &name() const { return name_; }
    [[nodiscard]] const std::string &below() const { return below_; }
    [[nodiscard]] const struct stat &status() const { return status_; }
    [[nodiscard]] bool is_folder() const { return S_ISDIR(status_.st_mode); }
    [[nodiscard]] int folder() const { return folder_.get(); }

  private:
    struct Level {
        std::vector<std::string> names;
        std::size_t read = 0;
        std::string name;       // of the folder itself, in the one above
        std::size_t below_size; // length of its path below the start
        dev_t device;
        ino_t inode;
    };

    bool open_level(ZelSvcFd folder);
    bool go_up();
    void set_name(std::string name);

    ZelSvcFd folder_;
    std::vector<Level> levels_;
    std::string name_;
    std::string below_;
    struct stat status_ = {};
};
