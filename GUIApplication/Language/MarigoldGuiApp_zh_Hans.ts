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
        <source>Calibrating</source>
        <translation>正在校准</translation>
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
        <translation>将白线对准所需的参考位置，把仪器放在白色校准板上。</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的效果参考板验证仪器。序列号：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>将白线对准所需的参考位置，把仪器放在效果参考板上</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的白色参考板进行自检。序列号：%1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>将白线对准所需的参考位置，把仪器放在白色参考板上</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>使用仪器随附的效果参考板进行自检。序列号：%1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>将仪器抬起悬空（不放在任何物体上）进行自检</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>自检 %1：%2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>参考板检查</translation>
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
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>清除数据库</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>确定要清除数据库吗？仪器上的所有样本和作业都将被删除。</translation>
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
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>删除样本？</translation>
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
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>相机图像</translation>
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
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>备注</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>特殊字符</translation>
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
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>摘要</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>测量</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>任务详情</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名称：</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1：</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>备注：</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>发送任务到服务器</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC 结果</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>平均结果</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>测量结果</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>已完成 %1/%2</translation>
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
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>此任务不是在本仪器上创建的。确定要编辑该任务吗？</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>编辑</translation>
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
        <translation>名称</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>作业名称不能为空</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>请输入一个不重复且非空的作业名称</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>作业名称已存在</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>该作业名称已存在，请改为唯一的名称</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>标签名称不存在</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>该标签名称不存在，请改为已有的标签名称</translation>
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
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>沿圆圈拖动圆点一周以确认</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>恢复出厂设置</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>所有设置将恢复为默认值。所有作业和样本也将丢失！</translation>
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
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>颜色视图</translation>
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
        <translation>15%1 纹理</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>完成此任务还需要更多测量</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>测量</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>相机图像</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>详细信息</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
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
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>数据库 / 存储</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>样本</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>作业</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>清除数据库</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>没有文件</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>显示设置</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>屏幕亮度</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>无法显示该文件。</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>无法读取该文件。</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>语言</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>法律信息</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1小时</translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1小时</translation>
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
        <translation>从不</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>屏幕变暗：%1后
待机：%2后
关机：%3后</translation>
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
        <translation>从不</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>设置</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>有效</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>已过期</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>未连接</translation>
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
        <translation>电源</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>语言</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>校准</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>测量选项</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>显示设置</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>提示音音量</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>节能选项</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>系统与诊断</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>开</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>关</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>测量选项</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>自动测量</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>自动测量开始前的时间（秒）：</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>测量模式</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>所需有效测量次数：</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>最大测量次数：</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>自动测量：%1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>显示 LABCH：%1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>忽略压力传感器：%1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>节能
选项</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>屏幕变暗</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>待机模式</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>关机</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>屏幕变暗前的秒数：</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>进入待机前的分钟数：</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>关机前的分钟数：</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>电源</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>关机</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>重启</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>关闭仪器？</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>确定要关闭仪器吗？</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>进入待机模式？</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>确定要让仪器进入待机模式吗？</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>重启仪器？</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>确定要重启仪器吗？</translation>
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
        <translation>系统与
诊断</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>系统信息</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>数据库 / 存储</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>法律信息</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>自检</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>系统信息</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>未配置</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>型号：</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>序列号：</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>部件号：</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>白板：</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>认证日期：</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>固件版本：</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>界面版本：</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>内核：</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>引导程序：</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>服务器 URL：</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>恢复出厂设置</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>开源软件</translation>
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
        <translation>开</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>关</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>静态 IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>已知网络</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>可用网络</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>连接问题</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>密码错误</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>网络不在范围内</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
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
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>作业</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>按下按钮进行测量。</translation>
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
        <translation>测量</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>结束</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>在线模式</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>已平均 %1 / SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>确定</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>退出在线模式？</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>退出在线模式将停止定位并返回作业列表。</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>退出</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>停止测量？</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>所有已测样本和此作业将被永久删除。</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>此作业的所有已测样本将被永久删除。</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>继续</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>温度超出范围。继续在线模式直到完成，还是退出在线模式并返回作业列表？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>温度超出范围。继续作业直到完成，还是删除作业及所有样本并返回作业列表？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>温度超出范围。继续作业直到完成，还是删除所有样本并返回作业列表？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>忽略压力传感器？</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>并非所有压力传感器都已激活。再次按下测量按钮开始测量，或按取消返回定位模式。</translation>
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
        <translation>并非所有压力传感器都已激活。测量前请确保所有压力传感器都已激活</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>继续测量？</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>要继续测量，请按确定</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>作业时间已到</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>作业未在规定时间内完成</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC 已强制结束，结果为所有读数的平均值。</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>此作业的 SMC 测量次数已达上限</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>已完成</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>作业已完成。按确定退出在线模式</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC 已强制结束，已取所有读数的平均值。按确定退出在线模式</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC 在最多 %1 次测量后失败，最终结果为平均值。按确定退出在线模式</translation>
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
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>密码</translation>
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
