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
        <source>Do not touch or bump instrument</source>
        <translation>Do not touch or bump instrument</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrating</translation>
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
        <source>Reference Tile Check</source>
        <translation>Reference Tile Check</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Self Test %1: %2</translation>
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
