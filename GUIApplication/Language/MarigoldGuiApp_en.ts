<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Warning</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Reference Check Failed</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Instrument Is Full</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>No database entries</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Measurement Cancelled</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>The instrument was moved during a measurement</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Index invalid</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Calibration Error</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Instrument not on white tile, or internal white dirty</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Calibration data not valid</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Not calibrated</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>External white tile too dirty or incorrect white tile</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Measurement Aborted</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>The measurement has been aborted by the user</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Battery is low. Charge the battery</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Battery is empty. Instrument will shut down</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Error in shutter motor</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>No stored reference measurement</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Spectral integration time on white too long</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Wavelength shift above absolute limit of 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Low Storage</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problem occurred changing Wi-Fi modes</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problem occurred scanning for Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Sample temperature too high (IR Sensor)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Sample temperature too low (IR Sensor)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Battery level is too low for update</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Date and time not set</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problem during initialization. Please reboot the device</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Hardware communication error. Please reboot the device</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Error during measurement</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Different best matches for checkpoints</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrating</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Delete All Samples?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Delete Sample?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Camera Images</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Delete Job</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>View/Edit Job</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copy Job</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Send Job To Server</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Execute Job</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Delete All Completed Jobs</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Jobs</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Open</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Complete</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Open (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Complete (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Delete Job?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>The entire job and all samples will be permanently deleted.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Delete All Completed Jobs?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>All completed jobs will be permanently deleted.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Instrument Is Full</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>A new job cannot be created until one or more existing jobs are removed from the instrument.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Summary</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Measure</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Job Details</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Name:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notes:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Send Job To Server</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC Results</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Average Results</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Measurements</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1 of %2 completed</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Delete Job?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>The entire job and all samples will be permanently deleted.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warning</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>This job was not created on the instrument. Are you sure you want to edit the job?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Edit</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrument Locked</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Measuring</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Hold Steady</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Do not touch or bump instrument</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Calculating</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>OK to move instrument</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Power Off</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reboot</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>An error has occurred, please reboot the instrument</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Color View</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>15%1 Series</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>45%1 Series</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>15%1 Texture</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>More measurements are needed to complete this job</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Measurement</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Camera Images</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Details</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>English</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Spanish</translation>
    </message>
    <message>
        <source>French</source>
        <translation>French</translation>
    </message>
    <message>
        <source>German</source>
        <translation>German</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italian</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portuguese</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japanese</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Korean</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chinese Simplified</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Custom</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>Diffuse</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>Mid Tier</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>No Averaging</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Averaging 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Averaging 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>White Tile</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Reference Tile</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Lifted</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>White Tile Complete</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Reference Tile Complete</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Lifted Complete</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Syncing Job Data</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Store Average</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Restart Job</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Undo</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Back</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Send All Jobs To Server</translation>
    </message>
</context>
</TS>
