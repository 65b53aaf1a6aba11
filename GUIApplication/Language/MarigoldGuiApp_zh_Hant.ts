<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_TW">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>需要校準</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>儀器校準前無法進行新的測量。按「校準」開始校準。</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>忽略</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校準</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>需要在 %1 %2內校準</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>秒</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>分鐘</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>小時</translation>
    </message>
    <message>
        <source>days</source>
        <translation>天</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>校準即將開始</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>正在校準</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>請勿觸碰或撞擊儀器</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>正在計算</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完成</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>可以移動儀器</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>測量即將開始</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>正在測量</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>並非所有壓力感測器都已啟用。所有壓力感測器啟用後，按「確定」開始校準</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>位置不正確</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>放在平整表面上</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>對齊白線</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>點選校準按鈕開始校準</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校準</translation>
    </message>
    <message>
        <source>or</source>
        <translation>或</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>按儀器上的測量按鈕</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>步驟 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>步驟 %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>點選自檢按鈕開始自檢</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>自檢</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>使用儀器隨附的白色參考板校準儀器。</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>序列號：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>將白線對準所需的參考位置，把儀器放在白色校準板上。</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用儀器隨附的效果參考板驗證儀器。序列號：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>將白線對準所需的參考位置，把儀器放在效果參考板上</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用儀器隨附的白色參考板進行自檢。序列號：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>將白線對準所需的參考位置，把儀器放在白色參考板上</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用儀器隨附的效果參考板進行自檢。序列號：%1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>將儀器抬起懸空（不放在任何物體上）進行自檢</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>校準</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>自檢 %1：%2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>參考板檢查</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>參考檢查失敗</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>儀器儲存已滿</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>記憶體不足，無法完成此任務。請刪除現有任務以釋放記憶體。</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>錯誤</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>資料庫中無條目</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>測量已取消</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>測量過程中儀器被移動</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>索引無效</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>校準錯誤</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>儀器未放在白板上，或內部白板髒汙</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>校準資料無效</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>未校準</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>外部白板太髒或白板不正確</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>測量中止</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>使用者已中止測量</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>電量低，請充電</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>電池電量耗盡，儀器即將關機</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>快門電機錯誤</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>沒有已儲存的參考測量</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>白板光譜積分時間過長</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>波長偏移超過 5 nm 絕對限值</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>儲存空間不足</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>切換 Wi-Fi 模式時出現問題</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>掃描 Wi-Fi 時出現問題</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>樣品溫度過高（紅外感測器）</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>樣品溫度過低（紅外感測器）</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>電量過低，無法更新</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>未設定日期和時間</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>初始化時出現問題，請重啟裝置</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>硬體通訊錯誤，請重啟裝置</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>測量過程中出錯</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>檢查點的最佳匹配不一致</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>正在校準</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>清除資料庫</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>確定要清除資料庫嗎？儀器上的所有樣本和作業都將被刪除。</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>刪除所有樣品？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
    <message>
        <source>No</source>
        <translation>否</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>刪除樣本？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
    <message>
        <source>No</source>
        <translation>否</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>相機影像</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>刪除任務</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>檢視/編輯任務</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>複製任務</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>傳送任務到伺服器</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>執行任務</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>備註</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>特殊字元</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>刪除所有已完成任務</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>任務</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>未完成</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>已完成</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>未完成 (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>已完成 (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>刪除任務？</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>整個任務及所有樣品將被永久刪除。</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>刪除所有已完成任務？</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>所有已完成任務將被永久刪除。</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>儀器儲存已滿</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>需先從儀器中刪除一個或多個現有任務，才能建立新任務。</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>記憶體不足，無法完成此任務。請刪除現有任務以釋放記憶體。</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>摘要</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>測量</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>儲存</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>任務詳情</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名稱：</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1：</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>備註：</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>傳送任務到伺服器</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC 結果</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>平均結果</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>測量結果</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>已完成 %1/%2</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>刪除任務？</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>整個任務及所有樣品將被永久刪除。</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>此任務不是在本儀器上建立的。確定要編輯該任務嗎？</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編輯</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>名稱</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>作業名稱不能為空</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>請輸入一個不重複且非空的作業名稱</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>作業名稱已存在</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>該作業名稱已存在，請改為唯一的名稱</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>標籤名稱不存在</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>該標籤名稱不存在，請改為已有的標籤名稱</translation>
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
        <translation>儀器已鎖定</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>正在測量</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>保持穩定</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>請勿觸碰或撞擊儀器</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>正在計算</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>可以移動儀器</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>關機</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>重啟</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>沿圓圈拖動圓點一週以確認</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>恢復出廠設定</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>所有設定將恢復為預設值。所有作業和樣本也將丟失！</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>錯誤</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>發生錯誤，請重啟儀器</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>顏色檢視</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>15%1 系列</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>45%1 系列</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>15%1 紋理</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>完成此任務還需要更多測量</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>測量</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>相機影像</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>詳細資訊</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>通過</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>失敗</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>已取消</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>錯誤</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>將儀器保持懸空</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>請勿觸碰或撞擊儀器</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完成</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>自檢</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>白色校準</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>白色參考檢查</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>效果板測試</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>重複性測試</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>溫度測試</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>壓力感測器測試</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>檢查錯誤日誌</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>正在測試...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>所有測試已完成</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>自檢已取消</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>資料庫 / 儲存</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>樣本</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>作業</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>清除資料庫</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>沒有檔案</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>顯示設定</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>螢幕亮度</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>無法顯示該檔案。</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>無法讀取該檔案。</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>語言</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>法律資訊</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1小時</translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1小時</translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1分</translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1秒</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>從不</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>螢幕變暗：%1後
待機：%2後
關機：%3後</translation>
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
        <translation>%1 / %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>從不</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>有效</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>已過期</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>未連線</translation>
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
        <translation>電源</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>語言</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>校準</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>測量選項</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>顯示設定</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>提示音音量</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>節能選項</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>系統與診斷</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>開</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>關</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>測量選項</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>自動測量</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>自動測量開始前的時間（秒）：</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>測量模式</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>所需有效測量次數：</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>最大測量次數：</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>自動測量：%1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>顯示 LABCH：%1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>忽略壓力感測器：%1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>節能
選項</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>螢幕變暗</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>待機模式</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>關機</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>螢幕變暗前的秒數：</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>進入待機前的分鐘數：</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>關機前的分鐘數：</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>電源</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>關機</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>重啟</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>關閉儀器？</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>確定要關閉儀器嗎？</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>進入待機模式？</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>確定要讓儀器進入待機模式嗎？</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>重啟儀器？</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>確定要重啟儀器嗎？</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>是</translation>
    </message>
    <message>
        <source>No</source>
        <translation>否</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>系統與
診斷</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>系統資訊</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>資料庫 / 儲存</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>法律資訊</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>自檢</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>系統資訊</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>未配置</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>型號：</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>序列號：</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>部件號：</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>白板：</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>認證日期：</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>韌體版本：</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>介面版本：</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>核心：</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>載入程式：</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>伺服器 URL：</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>恢復出廠設定</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>開源軟體</translation>
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
        <translation>提示音音量</translation>
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
        <translation>開</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>關</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>靜態 IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>已知網路</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>可用網路</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>連線問題</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>密碼錯誤</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>網路不在範圍內</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>英語</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>西班牙語</translation>
    </message>
    <message>
        <source>French</source>
        <translation>法語</translation>
    </message>
    <message>
        <source>German</source>
        <translation>德語</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>義大利語</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>葡萄牙語</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>日語</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>韓語</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>簡體中文</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>自定義</translation>
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
        <translation>漫射</translation>
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
        <translation>中端型</translation>
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
        <translation>不取平均</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>3 次平均</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>5 次平均</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>白板</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>參考板</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>抬起</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>白板完成</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>參考板完成</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>抬起完成</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>正在同步任務資料</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>作業</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>按下按鈕進行測量。</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>定位</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>已平均 0 / SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>測量</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>結束</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>線上模式</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>已平均 %1 / SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>確定</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>退出線上模式？</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>退出線上模式將停止定位並返回作業列表。</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>退出</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>停止測量？</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>所有已測樣本和此作業將被永久刪除。</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>此作業的所有已測樣本將被永久刪除。</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>繼續</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>溫度超出範圍。繼續線上模式直到完成，還是退出線上模式並返回作業列表？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>溫度超出範圍。繼續作業直到完成，還是刪除作業及所有樣本並返回作業列表？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>溫度超出範圍。繼續作業直到完成，還是刪除所有樣本並返回作業列表？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>刪除</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>忽略壓力感測器？</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>並非所有壓力感測器都已啟用。再次按下測量按鈕開始測量，或按取消返回定位模式。</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>提示</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>並非所有壓力感測器都已啟用。測量前請確保所有壓力感測器都已啟用</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>繼續測量？</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>要繼續測量，請按確定</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>作業時間已到</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>作業未在規定時間內完成</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC 已強制結束，結果為所有讀數的平均值。</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>此作業的 SMC 測量次數已達上限</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>已完成</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>作業已完成。按確定退出線上模式</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC 已強制結束，已取所有讀數的平均值。按確定退出線上模式</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC 在最多 %1 次測量後失敗，最終結果為平均值。按確定退出線上模式</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>儲存平均值</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>重新開始任務</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>撤銷</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>返回</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>傳送所有任務到伺服器</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>密碼</translation>
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
