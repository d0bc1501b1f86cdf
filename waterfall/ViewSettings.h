#pragma once
// The file "3dgraph.ini": axes, cameras and mode of the waterfall's window.

#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Files.h"
#include "platform/Services.h"

namespace zel {

class ViewSettings {
  public:
    ViewSettings(WaterfallForm& form, ApplicationFolder& folder, FileService& files)
        : form_(form), folder_(folder), files_(files) {}

    void readAxes();
    /// Both cameras, from the graph's own where the file has none. A camera that the file holds
    /// counts as moved by the user.
    void readCameras();
    /// Whether the spectrogram was shown last.
    bool readMode();
    double readDistance(double fallback);

    void write();
    /// The design's axes, and the translations as they are.
    void writeReset();

  private:
    std::string fileName();
    std::string stored(const std::string& file, const std::string& section, const std::string& key);
    /// True when the file holds the key.
    bool read(const std::string& file, const std::string& section, const std::string& key,
              double& number);

    WaterfallForm& form_;
    ApplicationFolder& folder_;
    FileService& files_;
};

}  // namespace zel
