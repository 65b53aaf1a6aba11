<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>需要校准</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>仪器校准前无法进行新的测量。按“校准”开始校准。</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>忽略</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>需要在 %1 %2内校准</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>秒</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>分钟</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>小时</translation>
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
        <translation>校准即将开始</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>请勿触碰或撞击仪器</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>正在校准</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>正在计算</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完成</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>可以移动仪器</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>测量即将开始</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>正在测量</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>并非所有压力传感器都已激活。所有压力传感器激活后，按“确定”开始校准</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>位置不正确</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
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
        <translation>对齐白线</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>点击校准按钮开始校准</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>or</source>
        <translation>或</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>按仪器上的测量按钮</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>步骤 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>步骤 %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>点击自检按钮开始自检</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>自检</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>使用仪器随附的白色参考板校准仪器。</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>序列号：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>将仪器放在白色校准板上，使白线对准参考标记。</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的效果参考板验证仪器。序列号：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>将仪器放在效果参考板上，使白线对准参考标记</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的白色参考板进行自检。序列号：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>将仪器放在白色参考板上，使白线对准参考标记</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的效果参考板进行自检。序列号：%1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>将仪器提起悬空（不放在任何物体上）进行自检</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>参考板检查</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>自检 %1：%2</translation>
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
        <translation>参考检查失败</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>仪器存储已满</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>内存不足，无法完成此任务。请删除现有任务以释放内存。</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>数据库中无条目</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>测量已取消</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>测量过程中仪器被移动</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>索引无效</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>校准错误</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>仪器未放在白板上，或内部白板脏污</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>校准数据无效</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>未校准</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>外部白板太脏或白板不正确</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>测量中止</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>用户已中止测量</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>电量低，请充电</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>电池电量耗尽，仪器即将关机</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>快门电机错误</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>没有已存储的参考测量</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>白板光谱积分时间过长</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>波长偏移超过 5 nm 绝对限值</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>存储空间不足</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>切换 Wi-Fi 模式时出现问题</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>扫描 Wi-Fi 时出现问题</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>样品温度过高（红外传感器）</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>样品温度过低（红外传感器）</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>电量过低，无法更新</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>未设置日期和时间</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>初始化时出现问题，请重启设备</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>硬件通信错误，请重启设备</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>测量过程中出错</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>检查点的最佳匹配不一致</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>正在校准</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>删除所有样品？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>No</source>
        <translation>否</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>删除任务</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>查看/编辑任务</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>复制任务</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>发送任务到服务器</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>执行任务</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>删除所有已完成任务</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>任务</translation>
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
        <translation>删除任务？</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>整个任务及所有样品将被永久删除。</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>删除所有已完成任务？</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>所有已完成任务将被永久删除。</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>仪器存储已满</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>需先从仪器中删除一个或多个现有任务，才能创建新任务。</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>内存不足，无法完成此任务。请删除现有任务以释放内存。</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>仪器已锁定</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>正在测量</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>保持稳定</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>请勿触碰或撞击仪器</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>正在计算</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>可以移动仪器</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>关机</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>重启</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>取消</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>发生错误，请重启仪器</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>通过</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>失败</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>已取消</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>将仪器保持悬空</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>请勿触碰或撞击仪器</translation>
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
        <translation>自检</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>白色校准</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>白色参考检查</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>效果板测试</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>重复性测试</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>温度测试</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>压力传感器测试</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>检查错误日志</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>正在测试...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>所有测试已完成</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>自检已取消</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>英语</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>西班牙语</translation>
    </message>
    <message>
        <source>French</source>
        <translation>法语</translation>
    </message>
    <message>
        <source>German</source>
        <translation>德语</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>意大利语</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>葡萄牙语</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>日语</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>韩语</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>简体中文</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>自定义</translation>
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
        <translation>参考板</translation>
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
        <translation>参考板完成</translation>
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
        <translation>正在同步任务数据</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>保存平均值</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>重新开始任务</translation>
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
        <translation>撤销</translation>
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
        <translation>发送所有任务到服务器</translation>
    </message>
</context>
</TS>
