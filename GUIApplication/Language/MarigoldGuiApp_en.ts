<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Calibration Required</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignore</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrate</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Calibration needed within %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>seconds</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>minutes</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>hours</translation>
    </message>
    <message>
        <source>days</source>
        <translation>days</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Calibration Starting</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrating</translation>
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
        <source>Complete</source>
        <translation>Complete</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>OK to move instrument</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Measurement Starting</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Measuring</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Incorrect Position</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>PLACE ON A FLAT SURFACE</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>ALIGN WHITE LINE</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Tap the calibrate button to start calibration</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrate</translation>
    </message>
    <message>
        <source>or</source>
        <translation>or</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Press the measurement button on the instrument</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Step 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Step %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Tap the self test button to start self testing</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Self Test</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibrate your instrument by using the white reference tile included with your instrument.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Serial Number: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Place the instrument on the effect reference tile by aligning the white line on the desired reference</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Place the instrument on the white reference tile by aligning the white line on the desired reference</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Self test your instrument by lifting the instrument into open air (not placed on anything)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibration</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Self Test %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Reference Tile Check</translation>
    </message>
</context>
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
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Clear Database</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</translation>
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
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Notes</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Special Keys</translation>
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
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>Job Name cannot be empty</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Enter a unique job name that is not empty</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>Job Name Already Exists</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>This job name already exists.  Please change the name to a unique name</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>Tag Name Does Not Exist</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>This tag name does not exist. Please change the name to an existing tag name</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
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
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Confirm by moving the dot around the circle</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restore Factory Settings</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>All current user settings will go back to defaults. Any jobs or samples will also be lost!</translation>
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
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Pass</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Fail</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Canceled</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Hold the instrument in open air</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Do not touch or bump instrument</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Complete</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Self Test</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>White Calibration</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Reference check on white</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Effect tile test</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Repeatability tests</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Temperature tests</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Pressure sensor test</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Check error logs</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Testing...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>All Tests Complete</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Self Tests Canceled</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Database / Memory</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Samples</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Jobs</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Clear Database</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>No files</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Display Settings</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Display Brightness</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>The file can&apos;t be shown.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>The file can&apos;t be read.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Language</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Legal Information</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 hour </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 hours </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 minutes and </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 seconds</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Never</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Display dims after: %1
Standby after: %2
Power off after: %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 of %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Never</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Settings</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Valid</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Expired</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>Not Connected</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Power</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Language</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Calibration</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Measurement Options</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Display Settings</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Beeper Volume</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Power Saving Options</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>System &amp; Diagnostics</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>On</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Off</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Measurement Options</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Auto Measurement</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Time to start auto measurement (sec):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Measurement Mode</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>No. of good measurements required:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Maximum measurements:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Auto Measurements: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>Display LABCH: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Override Pressure Sensors: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Power Saving
Options</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Dim Display</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Standby Mode</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Power Off</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Seconds until display dims:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minutes until standby mode:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minutes until power off:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Power</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Power Off</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reboot</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>Shutdown Instrument?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>Are you sure you want to shutdown the instrument?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>Enter Standby Mode?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>Are you sure you want to put the instrument into standby mode?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>Reboot Instrument?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>Are you sure you want to reboot the instrument?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Yes</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>System &amp;
Diagnostics</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>System Information</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Database / Memory</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Legal Information</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Self Test</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>System Information</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>Not Configured</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Instrument Model:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>Instrument Serial:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Part Number:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>White Reference Tile:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Certification Date:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Firmware Revision:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Interface Revision:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Kernel:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Bootloader:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>Server URL:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restore Factory Settings</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Open Source</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>Beeper Volume</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>On</source>
        <translation>On</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Off</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>Static IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Known Networks</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Unknown Networks</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Connection Issue</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Incorrect password</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Network not in range</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
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
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Job</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Press button to measure.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Targeting</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Averaged 0 of SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Measure</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Terminate</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Online Mode</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Averaged %1 of SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>Exit Online Mode?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>Exiting online mode will stop targeting and return to the job list.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Exit</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>Stop Measuring?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>All measured samples and this job will be permanently deleted.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>All measured samples from this job will be permanently deleted.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warning</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Continue</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>Override Pressure Sensors?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>Continue Measuring?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>To continue with measurements, press OK</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Job Time Elapsed</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>The job wasn&apos;t completed within the allocated time</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC force finished, all readings averaged for result.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Maximum number of SMC measurements used for this job</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Complete</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>The job has completed.  Press OK to exit online mode</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC force finished, all readings averaged for result.  Press OK to exit online mode</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</translation>
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
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Password</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
